#include "support/socket.h"

#include <netinet/in.h>
#include <sys/eventfd.h>
#include <sys/socket.h>
#include <unistd.h>

#include <bit>
#include <cerrno>
#include <system_error>

namespace raid::test {

namespace {

constexpr in_port_t servicePort = 34572;

sockaddr_in serviceAddress() {
    sockaddr_in address{};
    address.sin_family = AF_INET;
    address.sin_port = htons(servicePort);
    address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
    return address;
}

// The socket interface takes every kind of address as a sockaddr.
const sockaddr* generic(const sockaddr_in& address) {
    return std::bit_cast<const sockaddr*>(&address);
}

}  // namespace

void throwIfNegative(long result, const std::string& what) {
    if (result < 0) {
        throw std::system_error(errno, std::generic_category(), "cannot " + what);
    }
}

Socket& Socket::operator=(Socket&& other) noexcept {
    if (this != &other) {
        close();
        descriptor = std::exchange(other.descriptor, -1);
    }
    return *this;
}

Socket Socket::tcp() {
    const int created = ::socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0);
    throwIfNegative(created, "create a socket");
    return Socket(created);
}

Socket Socket::event() {
    const int created = eventfd(0, EFD_CLOEXEC);
    throwIfNegative(created, "create an event descriptor");
    return Socket(created);
}

Socket Socket::listening() {
    Socket socket = tcp();
    const int on = 1;
    throwIfNegative(setsockopt(socket.get(), SOL_SOCKET, SO_REUSEADDR, &on, sizeof on),
                    "reuse the service's address");
    const sockaddr_in address = serviceAddress();
    throwIfNegative(bind(socket.get(), generic(address), sizeof address),
                    "bind the service's port");
    throwIfNegative(listen(socket.get(), SOMAXCONN), "listen on the service's port");
    return socket;
}

Socket Socket::connected() {
    Socket socket = tcp();
    const sockaddr_in address = serviceAddress();
    throwIfNegative(connect(socket.get(), generic(address), sizeof address),
                    "connect to the service");
    return socket;
}

void Socket::close() noexcept {
    if (descriptor >= 0) {
        ::close(descriptor);
        descriptor = -1;
    }
}

}  // namespace raid::test
