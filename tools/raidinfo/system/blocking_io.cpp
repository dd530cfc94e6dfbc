#include "system/blocking_io.h"

#include <poll.h>
#include <unistd.h>

#include <cerrno>
#include <cstddef>

#include "system/cancellable.h"

namespace raidinfo {
namespace {

/// Whether the call that has just failed is worth another attempt. The signals of a cancel come
/// again and again, so that they alone do not keep it from what needs no wait.
bool mayGoOn(int file, short event) {
    if (errno != EINTR) {
        return false;
    }
    pollfd watched{file, event, 0};
    const bool goesOn = !isCancelled() || poll(&watched, 1, 0) > 0;
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
