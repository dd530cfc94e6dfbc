#include "system/folder.h"

#include <fcntl.h>
#include <unistd.h>

#include <cerrno>
#include <cstdlib>
#include <string>
#include <system_error>

namespace raidinfo {
namespace {

namespace fs = std::filesystem;

fs::path newFolder() {
    std::string name = (fs::temp_directory_path() / "raidinfo-XXXXXX").string();
    if (mkdtemp(name.data()) == nullptr) {
        throw std::system_error{errno, std::generic_category(), "cannot make " + name};
    }
    return name;
}

}  // namespace

TemporaryFolder::TemporaryFolder() : place{newFolder()} {}

TemporaryFolder::~TemporaryFolder() {
    std::error_code failed;
    fs::remove_all(place, failed);
}

WorkingFolder::WorkingFolder(const fs::path& folder)
    // NOLINTNEXTLINE(cppcoreguidelines-pro-type-vararg): open has no other form
    : before{open(".", O_PATH | O_DIRECTORY | O_CLOEXEC), "cannot open the working directory"} {
    fs::current_path(folder);
}

WorkingFolder::~WorkingFolder() {
    // A folder that the process was in takes it back, unless its mode was changed meanwhile.
    [[maybe_unused]] const int failed = fchdir(before.get());
}

}  // namespace raidinfo
