#include "process/standard_descriptors.h"

#include <fcntl.h>
#include <unistd.h>

namespace process {

namespace {

void fill(int descriptor, int access) noexcept {
    if (::fcntl(descriptor, F_GETFD) >= 0)
        return;
    // Kept when the program starts another, which has the same need.
    const int opened = ::open("/dev/null", access);
    if (opened < 0 || opened == descriptor)
        return;
    ::dup2(opened, descriptor);
    ::close(opened);
}

}  // namespace

void fillStandardDescriptors() noexcept {
    fill(STDIN_FILENO, O_RDWR);
    fill(STDOUT_FILENO, O_RDONLY);
    fill(STDERR_FILENO, O_RDWR);
}

}  // namespace process
