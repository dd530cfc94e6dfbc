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

void divertStandardOutput() {
    const Descriptor null{open("/dev/null", O_WRONLY | O_CLOEXEC), "cannot open /dev/null"};
    if (dup2(null.get(), STDOUT_FILENO) < 0) {
        throw failure(errno);
    }
}

}  // namespace

bool isStandardOutput(const std::filesystem::path& file) {
    return file == "-" || file == "/dev/stdout";
}

Output::Output()
    : original{fcntl(STDOUT_FILENO, F_DUPFD_CLOEXEC, STDERR_FILENO + 1),
               "cannot copy the standard output"} {
    divertStandardOutput();
}

void Output::write(std::string_view text) const {
    if (!writeAll(original.get(), text)) {
        throw failure(errno);
    }
}

}  // namespace raidinfo
