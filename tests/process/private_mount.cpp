#include "private_mount.h"

#include <sched.h>
#include <sys/mount.h>

#include <utility>

#include "support/socket.h"

namespace raid::test {

PrivateMount::PrivateMount(std::string directory, unsigned long size) : path(std::move(directory)) {
    throwIfNegative(unshare(CLONE_NEWNS), "enter a mount namespace");
    throwIfNegative(mount(nullptr, "/", nullptr, MS_REC | MS_PRIVATE, nullptr),
                    "keep mounts to this process");
    const std::string options = "size=" + std::to_string(size);
    throwIfNegative(mount("tmpfs", path.c_str(), "tmpfs", 0, options.c_str()),
                    "mount a file system at " + path);
}

PrivateMount::~PrivateMount() { umount2(path.c_str(), MNT_DETACH); }

void PrivateMount::makeReadOnly() const {
    throwIfNegative(mount(nullptr, path.c_str(), nullptr, MS_REMOUNT | MS_RDONLY, nullptr),
                    "make " + path + " read-only");
}

}  // namespace raid::test
