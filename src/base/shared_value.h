#pragma once

#include <atomic>

namespace raid::base {

// The exported flags and numbers stay plain data for their callers; inside the library they are
// read and written as relaxed atomics, since two host threads meet in them without a lock.

template <class Value>
[[nodiscard]] Value load(Value& shared) noexcept {
    return std::atomic_ref<Value>(shared).load(std::memory_order_relaxed);
}

template <class Value>
void store(Value& shared, Value value) noexcept {
    std::atomic_ref<Value>(shared).store(value, std::memory_order_relaxed);
}

}  // namespace raid::base
