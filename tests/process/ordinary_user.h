#pragma once

#include <linux/capability.h>
#include <sys/syscall.h>
#include <unistd.h>

#include <array>

#include "support/socket.h"

namespace raid::test {

// While it lives, the permissions of files hold for the calling thread, also when it is root's.
class OrdinaryUser {
public:
    OrdinaryUser() {
        throwIfNegative(syscall(SYS_capget, &header, before.data()), "look up capabilities");
        auto reduced = before;
        reduced[0].effective &=
            ~((1U << CAP_DAC_OVERRIDE) | (1U << CAP_DAC_READ_SEARCH) | (1U << CAP_FOWNER));
        throwIfNegative(syscall(SYS_capset, &header, reduced.data()), "give capabilities up");
    }
    OrdinaryUser(const OrdinaryUser&) = delete;
    OrdinaryUser& operator=(const OrdinaryUser&) = delete;
    ~OrdinaryUser() { syscall(SYS_capset, &header, before.data()); }

private:
    __user_cap_header_struct header{.version = _LINUX_CAPABILITY_VERSION_3, .pid = 0};
    std::array<__user_cap_data_struct, _LINUX_CAPABILITY_U32S_3> before{};
};

}  // namespace raid::test
