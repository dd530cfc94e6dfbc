#pragma once

#include <cerrno>

namespace raid::base {

/// Makes a system call again as long as a signal of the host interrupts it before it did anything.
template <class Call>
auto repeatOnSignal(Call call) noexcept {
    auto result = call();
    while (result < 0 && errno == EINTR) {
        result = call();
    }
    return result;
}

}  // namespace raid::base
