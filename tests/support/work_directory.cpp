#include "support/work_directory.h"

#include <cstdlib>
#include <string>

#include "support/socket.h"

namespace raid::test {

namespace fs = std::filesystem;

namespace {

fs::path makePrivateDirectory() {
    std::string name = (fs::temp_directory_path() / "raid-test-XXXXXX").string();
    throwIfNegative(mkdtemp(name.data()) == nullptr ? -1 : 0, "create " + name);
    return name;
}

}  // namespace

WorkDirectory::WorkDirectory() : start(fs::current_path()), root(makePrivateDirectory()) {
    reset();
}

WorkDirectory::~WorkDirectory() {
    std::error_code ignored;
    fs::current_path(start, ignored);
    fs::remove_all(root, ignored);
}

void WorkDirectory::reset() const {
    fs::current_path(root);
    for (const char* const name : {"run", "logs"}) {
        fs::remove_all(root / name);
        fs::create_directory(root / name);
    }
    fs::current_path(root / "run");
}

void WorkDirectoryReset::OnTestStart(const testing::TestInfo& /*info*/) { directory.reset(); }

}  // namespace raid::test
