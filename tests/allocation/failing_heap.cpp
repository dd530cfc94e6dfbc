#include "failing_heap.h"

#include <cerrno>
#include <cstddef>
#include <cstdlib>
#include <new>

namespace raid::test {

namespace {

struct State {
    bool watching = false;
    Failing failing = Failing::never;
    long left = 0;  // allocations that still succeed, and the one that does not
    bool hasFailed = false;
    long live = 0;
};

constinit thread_local State state;

[[nodiscard]] bool mayAllocate() noexcept {
    if (!state.watching || state.failing == Failing::never || --state.left > 0) {
        return true;
    }
    if (state.left < 0 && state.failing == Failing::once) {
        return true;
    }
    state.hasFailed = true;
    errno = ENOMEM;
    return false;
}

void* counted(void* block) noexcept {
    if (state.watching && block != nullptr) {
        ++state.live;
    }
    return block;
}

void discount(const void* block) noexcept {
    if (state.watching && block != nullptr) {
        --state.live;
    }
}

}  // namespace

FailingHeap::FailingHeap(Failing failing, long number) {
    state.failing = failing;
    state.left = number;
    state.hasFailed = false;
    state.watching = true;
}

FailingHeap::~FailingHeap() { state.watching = false; }

bool FailingHeap::hasFailed() { return state.hasFailed; }

long FailingHeap::liveBlocks() { return state.live; }

}  // namespace raid::test

using raid::test::counted;
using raid::test::discount;
using raid::test::mayAllocate;

// This program's own heap functions, which the library calls in place of the system's.

#if defined(__SANITIZE_ADDRESS__) || defined(__SANITIZE_THREAD__)

void* operator new(std::size_t size, const std::nothrow_t& /*nothrow*/) noexcept {
    return mayAllocate() ? counted(std::malloc(size)) : nullptr;
}

void* operator new(std::size_t size) {
    if (void* const block = operator new(size, std::nothrow)) {
        return block;
    }
    throw std::bad_alloc();
}

void* operator new[](std::size_t size) { return operator new(size); }
void* operator new[](std::size_t size, const std::nothrow_t& nothrow) noexcept {
    return operator new(size, nothrow);
}

void operator delete(void* block) noexcept {
    discount(block);
    std::free(block);
}
void operator delete(void* block, std::size_t /*size*/) noexcept { operator delete(block); }
void operator delete(void* block, const std::nothrow_t& /*nothrow*/) noexcept {
    operator delete(block);
}
void operator delete[](void* block) noexcept { operator delete(block); }
void operator delete[](void* block, std::size_t /*size*/) noexcept { operator delete(block); }
void operator delete[](void* block, const std::nothrow_t& /*nothrow*/) noexcept {
    operator delete(block);
}

void* operator new(std::size_t size, std::align_val_t alignment) {
    void* block = nullptr;
    if (!mayAllocate() || posix_memalign(&block, static_cast<std::size_t>(alignment), size) != 0) {
        throw std::bad_alloc();
    }
    return counted(block);
}
void operator delete(void* block, std::align_val_t /*alignment*/) noexcept {
    operator delete(block);
}
void operator delete(void* block, std::size_t /*size*/, std::align_val_t /*alignment*/) noexcept {
    operator delete(block);
}

#else

extern "C" {

void* __libc_malloc(std::size_t size);
void* __libc_calloc(std::size_t count, std::size_t size);
void* __libc_realloc(void* block, std::size_t size);
void* __libc_memalign(std::size_t alignment, std::size_t size);
void __libc_free(void* block);

void* malloc(std::size_t size) noexcept {
    return mayAllocate() ? counted(__libc_malloc(size)) : nullptr;
}

void* calloc(std::size_t count, std::size_t size) noexcept {
    return mayAllocate() ? counted(__libc_calloc(count, size)) : nullptr;
}

void* aligned_alloc(std::size_t alignment, std::size_t size) noexcept {
    return mayAllocate() ? counted(__libc_memalign(alignment, size)) : nullptr;
}

void* realloc(void* block, std::size_t size) noexcept {
    if (!mayAllocate()) {
        return nullptr;
    }
    void* const moved = __libc_realloc(block, size);
    if (moved != nullptr || size == 0) {
        discount(block);
        counted(moved);
    }
    return moved;
}

void free(void* block) noexcept {
    discount(block);
    __libc_free(block);
}

}  // extern "C"

#endif
