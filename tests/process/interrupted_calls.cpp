#include "interrupted_calls.h"

#include <fcntl.h>
#include <sys/syscall.h>
#include <unistd.h>

#include <cerrno>
#include <cstdarg>
#include <cstddef>

namespace raid::test {

namespace {

struct State {
    bool interrupts = false;
    bool next = true;
    int count = 0;
};

thread_local State state;

bool isInterrupted() {
    const bool interrupted = state.interrupts && state.next;
    state.next = !state.next;
    if (interrupted) {
        ++state.count;
        errno = EINTR;
    }
    return interrupted;
}

int openAt(const char* path, int flags, mode_t mode) {
    return isInterrupted() ? -1
                           : static_cast<int>(syscall(SYS_openat, AT_FDCWD, path, flags, mode));
}

mode_t modeOf(int flags, std::va_list arguments) {
    return (flags & O_CREAT) != 0 ? va_arg(arguments, mode_t) : 0;
}

}  // namespace

InterruptedCalls::InterruptedCalls() { state = {.interrupts = true}; }

InterruptedCalls::~InterruptedCalls() { state.interrupts = false; }

int InterruptedCalls::count() { return state.count; }

}  // namespace raid::test

// This program's own functions, which the library calls in place of the system's.
extern "C" {

int open(const char* path, int flags, ...) {
    std::va_list arguments;
    va_start(arguments, flags);
    const mode_t mode = raid::test::modeOf(flags, arguments);
    va_end(arguments);
    return raid::test::openAt(path, flags, mode);
}

int open64(const char* path, int flags, ...) {
    std::va_list arguments;
    va_start(arguments, flags);
    const mode_t mode = raid::test::modeOf(flags, arguments);
    va_end(arguments);
    return raid::test::openAt(path, flags | O_LARGEFILE, mode);
}

ssize_t read(int descriptor, void* buffer, std::size_t size) {
    return raid::test::isInterrupted() ? -1 : syscall(SYS_read, descriptor, buffer, size);
}

}  // extern "C"
