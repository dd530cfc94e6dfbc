#include "doctor/settings_and_log.h"

#include <unistd.h>

#include <cerrno>
#include <filesystem>
#include <limits>
#include <optional>
#include <stdexcept>
#include <string>
#include <string_view>
#include <system_error>

#include "orvo/property_file.h"

namespace raidinfo {
namespace {

namespace fs = std::filesystem;
using Outcome = Examined::Outcome;

constexpr auto nowhere = "nowhere, for the working directory is gone";

/// Where the library looks for a file beside the working directory; nowhere if that is gone.
std::optional<fs::path> placeOf(const fs::path& name) {
    std::error_code unknown;
    const fs::path here = fs::current_path(unknown);
    return unknown ? std::nullopt : std::optional{(here / "../logs" / name).lexically_normal()};
}

std::string reasonOf(int error) { return std::generic_category().message(error); }

/// The library takes the number that the text begins with, and 0 where there is none.
std::string troubleOfLevel(const std::string& text) {
    const bool isSigned = text.starts_with('+') || text.starts_with('-');
    const std::string_view number = std::string_view{text}.substr(isSigned ? 1 : 0);
    const std::size_t end = number.find_first_not_of("0123456789");
    if (number.empty() || end == 0) {
        return "its LogLevel \"" + text + "\" is not a number";
    }
    return end == std::string_view::npos
               ? ""
               : "of its LogLevel \"" + text + "\" only the number that it begins with counts";
}

/// What keeps the level from the file from the library; "" where nothing does.
std::string troubleOf(const fs::path& file) {
    std::error_code unknown;
    if (!fs::is_regular_file(file, unknown)) {
        return "it is not a regular file, and is not read";
    }
    if (access(file.c_str(), R_OK) != 0) {
        return "it cannot be read: " + reasonOf(errno);
    }
    if (const auto size = fs::file_size(file, unknown);
        !unknown && size > Orvo::PropertyFile::sizeLimit) {
        return "it is longer than " + std::to_string(Orvo::PropertyFile::sizeLimit) +
               " bytes, and is not read";
    }
    Orvo::PropertyFile settings{Orvo::File::Path{file.string()}};
    try {
        settings.open(0);
        return troubleOfLevel(Orvo::make_string(settings.getValue(Orvo::make_wstring("LogLevel"))));
    } catch (const std::out_of_range&) {
        return "it has no LogLevel";
    } catch (const std::runtime_error&) {
        return "it cannot be read whole, and is not read";
    }
}

}  // namespace

void readSettings(const Library& library) {
    // No level lets this through but one that lets everything through, and then it is empty.
    library.function<void(int, const char*)>("_Z5debugiPKc")(std::numeric_limits<int>::max(), "");
}

Examined examinedSettings(const Library& library) {
    const int number = *library.variable<int>("LOG_LEVEL");
    const std::string level = "; log level " + std::to_string(number) +
                              (number < 0 ? ", which logs nothing, as 0 does" : "");
    Examined found{"settings", "Settings file", Outcome::fine, nowhere + level};
    if (const auto place = placeOf("RAIDInstrumentation.ini")) {
        std::error_code unknown;
        const bool isMissing = fs::status(*place, unknown).type() == fs::file_type::not_found;
        const std::string trouble = isMissing ? "" : troubleOf(*place);
        found.finding = place->string() + (isMissing ? ", which is not there" : "") +
                        (trouble.empty() ? "" : ": " + trouble) + level;
        found.outcome = trouble.empty() && number >= 0 ? Outcome::fine : Outcome::noteworthy;
    }
    return found;
}

Examined examinedLog(const Library& library) {
    const auto place = placeOf("RAIDInstrumentation.log");
    if (*library.variable<int>("LOG_LEVEL") <= 0) {
        return {"log", "Log file", Outcome::fine,
                (place ? place->string() : nowhere) + std::string{", which is off"}};
    }
    if (!place) {
        return {"log", "Log file", Outcome::noteworthy, nowhere};
    }
    std::error_code unknown;
    const bool isThere = fs::exists(*place, unknown);
    const fs::path written = isThere ? *place : place->parent_path();
    const int error = isThere && fs::is_directory(*place, unknown) ? EISDIR
                      : access(written.c_str(), W_OK) == 0         ? 0
                                                                   : errno;
    return {"log", "Log file", error == 0 ? Outcome::fine : Outcome::noteworthy,
            place->string() + (error == 0 ? "" : ": " + reasonOf(error) + "; nothing is logged")};
}

}  // namespace raidinfo
