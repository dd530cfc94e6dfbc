#include "doctor/library_log.h"

#include <algorithm>
#include <cerrno>
#include <cstdlib>
#include <system_error>

#include "system/file.h"

namespace raidinfo {
namespace {

namespace fs = std::filesystem;

fs::path makeFolder() {
    std::string name = (fs::temp_directory_path() / "raidinfo-XXXXXX").string();
    if (mkdtemp(name.data()) == nullptr) {
        throw std::system_error{errno, std::generic_category(), "cannot make a folder"};
    }
    return name;
}

fs::path currentFolder() {
    std::error_code gone;
    return fs::current_path(gone);
}

}  // namespace

LibraryLog::LibraryLog(const Library& library)
    : before{currentFolder()},
      folder{makeFolder()},
      level{library.variable<int>("LOG_LEVEL")},
      levelBefore{*level} {
    fs::create_directory(folder / "logs");
    fs::create_directory(folder / "run");
    fs::current_path(folder / "run");
    *level = 1;
}

LibraryLog::~LibraryLog() {
    *level = levelBefore;
    std::error_code failed;
    fs::current_path(before.empty() ? fs::path{"/"} : before, failed);
    fs::remove_all(folder, failed);
}

std::string LibraryLog::lastError() const {
    const fs::path file = folder / "logs/RAIDInstrumentation.log";
    std::error_code unknown;
    if (!fs::exists(file, unknown)) {
        return "";
    }
    const std::string text = readFile(file);
    const std::size_t begin = text.rfind("XML syntax error: ");
    if (begin == std::string::npos) {
        return "";
    }
    std::string message = text.substr(begin);
    message.erase(message.find_last_not_of('\n') + 1);
    // Each reader that the error passed on its way has added a line.
    std::ranges::replace(message, '\n', ';');
    return message;
}

}  // namespace raidinfo
