#include "process/standard_descriptors.h"

#include <fcntl.h>
#include <unistd.h>

namespace process {

namespace {

void fill(int descriptor) noexcept {
    if (::fcntl(descriptor, F_GETFD) >= 0)
        return;
    // Kept when the program starts another, which has the same need.
    const int opened = ::open("/dev/null", O_RDWR);
    if (opened < 0 || opened == descriptor)
        return;
    ::dup2(opened, descriptor);
    ::close(opened);
}

}  // namespace

void fillStandardDescriptors() noexcept {
    fill(STDIN_FILENO);
    fill(STDERR_FILENO);
}

}  // namespace process
