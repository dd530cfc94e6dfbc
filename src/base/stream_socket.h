#pragma once

#include <sys/types.h>

#include <chrono>
#include <cstdint>
#include <span>
#include <string_view>

#include "base/file_descriptor.h"

namespace raid::base {

/// One TCP connection over IPv4. Results are those of the system calls: negative for an error.
/// A call that a signal interrupts before it did anything is repeated, except the wait, whose
/// caller looks at its own flags first.
class StreamSocket {
public:
    /// A socket that could not be created shows as a negative handle and a failing connect.
    StreamSocket() noexcept;

    [[nodiscard]] int handle() const noexcept { return descriptor.get(); }

    [[nodiscard]] int connect(const char* address, std::uint16_t port) const noexcept;

    /// Never raises SIGPIPE in the host.
    [[nodiscard]] ssize_t send(std::string_view bytes) const noexcept;

    /// 1 when a receive would not block, 0 when the slice passed, negative for an error or a
    /// signal. Works for descriptors of any value.
    [[nodiscard]] int waitReadable(std::chrono::milliseconds slice) const noexcept;

    [[nodiscard]] ssize_t receive(std::span<char> buffer) const noexcept;

    void close() noexcept { descriptor = FileDescriptor(-1); }

    /// Leaves the connection open for good: nothing closes it any more.
    void abandon() noexcept { descriptor.release(); }

private:
    FileDescriptor descriptor;
};

}  // namespace raid::base
