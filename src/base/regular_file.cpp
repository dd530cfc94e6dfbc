#include "base/regular_file.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>

#include "base/defer_cancellation.h"

namespace raid::base {

std::optional<RegularFile> RegularFile::open(const std::string& path) {
    const DeferCancellation deferred;
    // O_NONBLOCK matters for a pipe only: its open would otherwise wait for a writer.
    FileDescriptor file(::open(path.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK));
    struct stat status {};
    if (file.get() < 0 || ::fstat(file.get(), &status) != 0 || !S_ISREG(status.st_mode)) {
        return std::nullopt;
    }
    return RegularFile(std::move(file), static_cast<std::uint64_t>(status.st_size));
}

std::size_t RegularFile::read(std::span<char> buffer) const noexcept {
    const DeferCancellation deferred;
    std::size_t filled = 0;
    while (filled < buffer.size()) {
        const auto count = ::read(file.get(), buffer.data() + filled, buffer.size() - filled);
        if (count > 0) {
            filled += static_cast<std::size_t>(count);
        } else if (count == 0 || errno != EINTR) {
            break;
        }
    }
    return filled;
}

}  // namespace raid::base
