#include "base/stream_socket.h"

#include <arpa/inet.h>
#include <netinet/in.h>
#include <poll.h>
#include <sys/socket.h>

#include <cerrno>

#include "base/repeat_on_signal.h"

namespace raid::base {
namespace {

constexpr int forever = -1;

int waitFor(int descriptor, short events, int milliseconds) noexcept {
    pollfd entry{descriptor, events, 0};
    return ::poll(&entry, 1, milliseconds);
}

/// A connect that a signal interrupted goes on by itself: wait for its end and take its result.
int finishConnect(int descriptor) noexcept {
    if (repeatOnSignal([&] { return waitFor(descriptor, POLLOUT, forever); }) < 0) {
        return -1;
    }
    int error = 0;
    socklen_t size = sizeof error;
    const int rc = ::getsockopt(descriptor, SOL_SOCKET, SO_ERROR, &error, &size);
    return rc == 0 && error == 0 ? 0 : -1;
}

}  // namespace

StreamSocket::StreamSocket() noexcept
    : descriptor(::socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0)) {}

int StreamSocket::connect(const char* address, std::uint16_t port) const noexcept {
    sockaddr_in peer{};
    peer.sin_family = AF_INET;
    peer.sin_port = htons(port);
    peer.sin_addr.s_addr = ::inet_addr(address);
    const int rc = ::connect(
        handle(), static_cast<const sockaddr*>(static_cast<const void*>(&peer)), sizeof peer);
    return rc < 0 && errno == EINTR ? finishConnect(handle()) : rc;
}

ssize_t StreamSocket::send(std::string_view bytes) const noexcept {
    return repeatOnSignal(
        [&] { return ::send(handle(), bytes.data(), bytes.size(), MSG_NOSIGNAL); });
}

int StreamSocket::waitReadable(std::chrono::milliseconds slice) const noexcept {
    return waitFor(handle(), POLLIN, static_cast<int>(slice.count()));
}

ssize_t StreamSocket::receive(std::span<char> buffer) const noexcept {
    return repeatOnSignal([&] { return ::recv(handle(), buffer.data(), buffer.size(), 0); });
}

}  // namespace raid::base
