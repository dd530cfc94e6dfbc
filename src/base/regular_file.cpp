#include "base/regular_file.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include "base/defer_cancellation.h"
#include "base/repeat_on_signal.h"

namespace raid::base {

std::optional<RegularFile> RegularFile::open(const std::string& path) {
    const DeferCancellation deferred;
    // O_NONBLOCK matters for a pipe only: its open would otherwise wait for a writer.
    FileDescriptor file(
        repeatOnSignal([&] { return ::open(path.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK); }));
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
        const auto rest = buffer.subspan(filled);
        const auto count =
            repeatOnSignal([&] { return ::read(file.get(), rest.data(), rest.size()); });
        if (count <= 0) {
            break;
        }
        filled += static_cast<std::size_t>(count);
    }
    return filled;
}

}  // namespace raid::base
