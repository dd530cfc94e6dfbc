#include "system/memory_file.h"

#include <sys/mman.h>
#include <unistd.h>

#include <cerrno>
#include <system_error>

#include "system/blocking_io.h"

namespace raidinfo {

MemoryFile::MemoryFile(std::string_view content)
    : file{memfd_create("raidinfo", MFD_CLOEXEC), "cannot make a file in memory"} {
    if (!writeAll(file.get(), content)) {
        throw std::system_error{errno, std::generic_category(), "cannot fill a file in memory"};
    }
    lseek(file.get(), 0, SEEK_SET);
}

std::string MemoryFile::path() const { return "/proc/self/fd/" + std::to_string(file.get()); }

}  // namespace raidinfo
