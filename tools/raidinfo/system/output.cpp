#include "system/output.h"

#include <fcntl.h>
#include <unistd.h>

#include <cerrno>
#include <system_error>

#include "exit_status.h"
#include "system/blocking_io.h"

namespace raidinfo {
namespace {

Failure failure(int reason) {
    return {ExitStatus::outputFailed,
            "cannot write the output: " + std::generic_category().message(reason)};
}

std::optional<Descriptor> copyOfStandardOutput() {
    const int copy = fcntl(STDOUT_FILENO, F_DUPFD_CLOEXEC, STDERR_FILENO + 1);
    return copy < 0 ? std::nullopt : std::optional<Descriptor>{std::in_place, copy, "no copy"};
}

/// The null device must not go with a Descriptor where it has got the number itself.
void divertStandardOutput() {
    const int null = open("/dev/null", O_WRONLY | O_CLOEXEC);
    if (null == STDOUT_FILENO) {
        return;
    }
    const Descriptor opened{null, "cannot open /dev/null"};
    if (dup2(opened.get(), STDOUT_FILENO) < 0) {
        throw failure(errno);
    }
}

}  // namespace

bool isStandardOutput(const std::filesystem::path& file) {
    return file == "-" || file == "/dev/stdout";
}

Output::Output() : original{copyOfStandardOutput()} { divertStandardOutput(); }

void Output::write(std::string_view text) const {
    if (!original) {
        throw failure(EBADF);
    }
    if (!writeAll(original->get(), text)) {
        throw failure(errno);
    }
}

}  // namespace raidinfo
