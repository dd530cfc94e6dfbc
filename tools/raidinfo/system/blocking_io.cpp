#include "system/blocking_io.h"

#include <poll.h>
#include <unistd.h>

#include <cerrno>
#include <cstddef>

#include "system/cancellable.h"

namespace raidinfo {
namespace {

/// Whether the call that has just failed is worth another attempt. The signals of a cancel come
/// again and again, so that they alone do not keep it from what needs no wait. Who started the
/// program may have left the file such that it does not wait by itself.
bool mayGoOn(int file, short event) {
    const int error = errno;
    if (error != EINTR && error != EAGAIN) {
        return false;
    }
    constexpr int untilReady = -1;
    pollfd watched{file, event, 0};
    bool goesOn = poll(&watched, 1, error == EAGAIN && !isCancelled() ? untilReady : 0) > 0;
    goesOn = goesOn || !isCancelled();
    errno = EINTR;
    return goesOn;
}

}  // namespace

bool writeAll(int file, std::string_view content) {
    while (!content.empty()) {
        const ssize_t written = write(file, content.data(), content.size());
        if (written >= 0) {
            content.remove_prefix(static_cast<std::size_t>(written));
        } else if (!mayGoOn(file, POLLOUT)) {
            return false;
        }
    }
    return true;
}

ssize_t readSome(int file, std::span<char> room) {
    while (true) {
        const ssize_t size = read(file, room.data(), room.size());
        if (size >= 0 || !mayGoOn(file, POLLIN)) {
            return size;
        }
    }
}

}  // namespace raidinfo
