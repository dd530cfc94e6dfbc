#include "doctor/library_log.h"

#include <algorithm>
#include <filesystem>
#include <system_error>
#include <utility>

#include "system/file.h"

namespace raidinfo {
namespace {

namespace fs = std::filesystem;

constexpr int ofErrors = 1;

/// The folder to work in, so that the one for the log is beside it.
fs::path foldersIn(const fs::path& folder) {
    fs::create_directory(folder / "logs");
    fs::create_directory(folder / "run");
    return folder / "run";
}

}  // namespace

LibraryLog::Level::Level(const Library& library)
    : level{*library.variable<int>("LOG_LEVEL")}, before{std::exchange(level, ofErrors)} {}

LibraryLog::Level::~Level() { level = before; }

LibraryLog::Place::Place(const Library& library)
    : working{foldersIn(folder.path())}, level{library} {}

LibraryLog::LibraryLog(const Library& library) {
    try {
        place.emplace(library);
    } catch (const std::system_error& error) {
        reason = "there is no temporary folder: " + error.code().message();
    }
}

std::string LibraryLog::lastError() const {
    std::error_code unknown;
    const fs::path file =
        place ? place->folder.path() / "logs/RAIDInstrumentation.log" : fs::path{};
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
