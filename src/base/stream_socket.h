#pragma once

#include <sys/types.h>

#include <chrono>
#include <cstdint>
#include <optional>
#include <span>
#include <string_view>

#include "base/file_descriptor.h"

namespace raid::base {

/// One TCP connection over IPv4. Results are those of the system calls: negative for an error.
/// A call that a signal interrupts before it did anything is repeated, except those that wait for
/// a slice of time: their callers look at flags of their own first.
class StreamSocket {
public:
    /// A socket that could not be created shows as a negative handle and a failing connect.
    StreamSocket() noexcept;

    [[nodiscard]] int handle() const noexcept { return descriptor.get(); }

    /// Nothing while the connection is still on its way; then waitConnected goes on.
    [[nodiscard]] std::optional<int> connect(const char* address, std::uint16_t port,
                                             std::chrono::milliseconds slice) const noexcept;
    [[nodiscard]] std::optional<int> waitConnected(std::chrono::milliseconds slice) const noexcept;

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
