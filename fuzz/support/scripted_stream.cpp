#include "support/scripted_stream.h"

#include <poll.h>
#include <sys/socket.h>
#include <sys/types.h>

#include <algorithm>
#include <cerrno>
#include <span>

#include "agent/exchange.h"

namespace raid::fuzz {
namespace {

using Kind = Happening::Kind;

constexpr int handle = 1'000'000;  // above every real descriptor

std::vector<Happening> happenings;
std::size_t current = 0;
std::size_t taken = 0;  // of the current piece
bool closed = true;

bool isOver() { return current == happenings.size(); }

int interrupted() {
    errno = EINTR;
    return -1;
}

/// A wait: 1 when a receive would not block.
int wait() {
    if (isOver()) {
        return 1;
    }
    switch (happenings[current].kind) {
        case Kind::piece:
        case Kind::reset:
            return 1;
        case Kind::signal:
            ++current;
            return interrupted();
        case Kind::disconnect:
            disconnectSocket();
            [[fallthrough]];
        case Kind::silence:
            ++current;
            return 0;
    }
    return 1;
}

ssize_t receive(std::span<char> buffer) {
    if (isOver()) {
        return 0;
    }
    const auto& now = happenings[current];
    if (now.kind != Kind::piece) {
        ++current;
        errno = now.kind == Kind::reset ? ECONNRESET : EINTR;
        return -1;
    }
    const auto rest = std::span(now.bytes).subspan(taken);
    const auto count = std::min(rest.size(), buffer.size());
    std::ranges::copy(rest.first(count), buffer.begin());
    taken += count;
    if (taken == now.bytes.size()) {
        ++current;
        taken = 0;
    }
    return static_cast<ssize_t>(count);
}

}  // namespace

void play(std::vector<Happening> script) {
    happenings = std::move(script);
    current = 0;
    taken = 0;
    closed = false;
}

bool isClosed() { return closed; }

}  // namespace raid::fuzz

// The names that the linker gives to what is wrapped.
extern "C" {

int __real_close(int descriptor);  // NOLINT(bugprone-reserved-identifier)

int __wrap_socket(int /*domain*/, int /*type*/, int /*protocol*/) { return raid::fuzz::handle; }

int __wrap_connect(int /*descriptor*/, const sockaddr* /*address*/, socklen_t /*size*/) {
    return 0;
}

ssize_t __wrap_send(int /*descriptor*/, const void* /*bytes*/, std::size_t size, int /*flags*/) {
    return static_cast<ssize_t>(size);
}

int __wrap_poll(pollfd* /*entries*/, nfds_t /*count*/, int /*milliseconds*/) {
    return raid::fuzz::wait();
}

ssize_t __wrap_recv(int /*descriptor*/, void* buffer, std::size_t size, int /*flags*/) {
    return raid::fuzz::receive({static_cast<char*>(buffer), size});
}

int __wrap_close(int descriptor) {
    if (descriptor != raid::fuzz::handle) {
        return __real_close(descriptor);
    }
    raid::fuzz::closed = true;
    return 0;
}
}
