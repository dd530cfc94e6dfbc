#pragma once

#include <string>
#include <utility>

namespace raid::test {

// Throws std::system_error of errno, saying what could not be done.
void throwIfNegative(long result, const std::string& what);

// Owns one descriptor.
class Socket {
public:
    explicit Socket(int owned) noexcept : descriptor(owned) {}
    Socket(Socket&& other) noexcept : descriptor(std::exchange(other.descriptor, -1)) {}
    Socket& operator=(Socket&& other) noexcept;
    Socket(const Socket&) = delete;
    Socket& operator=(const Socket&) = delete;
    ~Socket() { close(); }

    [[nodiscard]] static Socket tcp();
    // Listens on the port and address of the service.
    [[nodiscard]] static Socket listening();
    // Connected to the service's port and address.
    [[nodiscard]] static Socket connected();
    // Readable once it was written to: what wakes a thread that waits for descriptors.
    [[nodiscard]] static Socket event();

    [[nodiscard]] int get() const noexcept { return descriptor; }
    void close() noexcept;

private:
    int descriptor;
};

}  // namespace raid::test
