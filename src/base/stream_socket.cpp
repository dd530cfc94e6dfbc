#include "base/stream_socket.h"

#include <arpa/inet.h>
#include <netinet/in.h>
#include <poll.h>
#include <sys/socket.h>
#include <sys/time.h>

#include <cerrno>

#include "base/repeat_on_signal.h"

namespace raid::base {
namespace {

int waitFor(int descriptor, short events, int milliseconds) noexcept {
    pollfd entry{descriptor, events, 0};
    return ::poll(&entry, 1, milliseconds);
}

/// How long a connect may keep its caller; without end at 0. It limits a send, too.
void limitConnect(int descriptor, std::chrono::milliseconds limit) noexcept {
    const auto seconds = std::chrono::floor<std::chrono::seconds>(limit);
    const std::chrono::microseconds rest = limit - seconds;
    timeval time{};
    time.tv_sec = static_cast<decltype(time.tv_sec)>(seconds.count());
    time.tv_usec = static_cast<decltype(time.tv_usec)>(rest.count());
    ::setsockopt(descriptor, SOL_SOCKET, SO_SNDTIMEO, &time, sizeof time);
}

}  // namespace

StreamSocket::StreamSocket() noexcept
    : descriptor(::socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0)) {}

std::optional<int> StreamSocket::connect(const char* address, std::uint16_t port,
                                         std::chrono::milliseconds slice) const noexcept {
    sockaddr_in peer{};
    peer.sin_family = AF_INET;
    peer.sin_port = htons(port);
    peer.sin_addr.s_addr = ::inet_addr(address);
    limitConnect(handle(), slice);
    const int rc = ::connect(
        handle(), static_cast<const sockaddr*>(static_cast<const void*>(&peer)), sizeof peer);
    // In both cases the kernel goes on with it.
    const bool isUnderWay = rc < 0 && (errno == EINPROGRESS || errno == EINTR);
    limitConnect(handle(), {});
    return isUnderWay ? std::nullopt : std::optional(rc);
}

std::optional<int> StreamSocket::waitConnected(std::chrono::milliseconds slice) const noexcept {
    if (waitFor(handle(), POLLOUT, static_cast<int>(slice.count())) <= 0) {
        return std::nullopt;
    }
    int error = 0;
    socklen_t size = sizeof error;
    const int rc = ::getsockopt(handle(), SOL_SOCKET, SO_ERROR, &error, &size);
    return rc == 0 && error == 0 ? 0 : -1;
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
