#include "support/network_isolation.h"

#include <fcntl.h>
#include <net/if.h>
#include <sched.h>
#include <sys/file.h>
#include <sys/ioctl.h>
#include <sys/socket.h>
#include <unistd.h>

#include <cerrno>
#include <filesystem>
#include <fstream>
#include <system_error>

#include "support/socket.h"

namespace raid::test {

namespace {

// An unmapped user could not be looked up and would own nothing.
void keepIdentity(uid_t user, gid_t group) {
    std::ofstream("/proc/self/setgroups") << "deny";
    std::ofstream("/proc/self/uid_map") << user << ' ' << user << " 1";
    std::ofstream("/proc/self/gid_map") << group << ' ' << group << " 1";
}

bool enterNamespace() {
    const uid_t user = geteuid();
    const gid_t group = getegid();
    if (unshare(CLONE_NEWNET) == 0) {
        return true;
    }
    if (unshare(CLONE_NEWUSER | CLONE_NEWNET) != 0) {
        return false;
    }
    keepIdentity(user, group);
    return true;
}

void bringLoopbackUp() {
    const Socket socket = Socket::tcp();
    ifreq request{};
    request.ifr_name[0] = 'l';
    request.ifr_name[1] = 'o';
    request.ifr_flags = IFF_UP | IFF_RUNNING;
    throwIfNegative(ioctl(socket.get(), SIOCSIFFLAGS, &request), "bring the loopback interface up");
}

void holdExclusiveLock() {
    const auto path = std::filesystem::temp_directory_path() / "raid-instrumentation-tests.lock";
    const int lock = open(path.c_str(), O_RDONLY | O_CREAT | O_NOFOLLOW, 0644);
    throwIfNegative(lock, "open " + path.string());
    int result = -1;
    do {
        result = flock(lock, LOCK_EX);
    } while (result < 0 && errno == EINTR);
    throwIfNegative(result, "lock " + path.string());
}

}  // namespace

std::string isolateNetwork() {
    if (enterNamespace()) {
        bringLoopbackUp();
        return "a network namespace of its own";
    }
    const std::string reason = std::generic_category().message(errno);
    holdExclusiveLock();
    return "an exclusive lock (no network namespace: " + reason + ")";
}

}  // namespace raid::test
