#include "system/memory_file.h"

#include <sys/mman.h>
#include <unistd.h>

#include <cerrno>
#include <cstddef>
#include <system_error>

namespace raidinfo {

MemoryFile::MemoryFile(std::string_view content)
    : file{memfd_create("raidinfo", MFD_CLOEXEC), "cannot make a file in memory"} {
    while (!content.empty()) {
        const ssize_t written = write(file.get(), content.data(), content.size());
        if (written < 0 && errno != EINTR) {
            throw std::system_error{errno, std::generic_category(), "cannot fill a file in memory"};
        }
        content.remove_prefix(written > 0 ? static_cast<std::size_t>(written) : 0);
    }
    lseek(file.get(), 0, SEEK_SET);
}

std::string MemoryFile::path() const { return "/proc/self/fd/" + std::to_string(file.get()); }

}  // namespace raidinfo
