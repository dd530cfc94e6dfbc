// Lets the library read a settings file, and compares the level with what a plain reading of the
// lines gives.

#include <sys/mman.h>
#include <unistd.h>

#include <cstdlib>
#include <optional>
#include <sstream>
#include <string>

#include "base/decimal.h"
#include "orvo/property_file.h"
#include "support/input.h"
#include "support/require.h"

namespace {

using namespace raid;

int memoryFile() {
    static const int file = memfd_create("settings", 0);
    return file;
}

void write(const std::string& text) {
    const bool written =
        ftruncate(memoryFile(), 0) == 0 &&
        pwrite(memoryFile(), text.data(), text.size(), 0) == static_cast<ssize_t>(text.size());
    fuzz::require(written, "the fuzzer can write its file");
}

std::string trimmed(const std::string& text) {
    const char* const blanks = " \t\r\v\f";
    const auto first = text.find_first_not_of(blanks);
    return first == std::string::npos
               ? std::string()
               : text.substr(first, text.find_last_not_of(blanks) - first + 1);
}

/// The last value of the key.
std::optional<std::string> expectedOf(std::string text, const std::string& key) {
    if (text.rfind("\xEF\xBB\xBF", 0) == 0) {
        text.erase(0, 3);
    }
    std::optional<std::string> value;
    std::istringstream lines(text);
    for (std::string line; std::getline(lines, line);) {
        line = trimmed(line);
        const auto equals = line.find('=');
        const bool passed = line.empty() || std::string("#;[").find(line[0]) != std::string::npos;
        if (!passed && equals != std::string::npos && trimmed(line.substr(0, equals)) == key) {
            value = trimmed(line.substr(equals + 1));
        }
    }
    return value;
}

std::optional<std::string> valueOf(const std::string& key) {
    Orvo::PropertyFile file(Orvo::File::Path("/proc/self/fd/" + std::to_string(memoryFile())));
    file.open(3);
    try {
        return Orvo::make_string(file.getValue(Orvo::make_wstring(key)));
    } catch (const std::out_of_range&) {
        return std::nullopt;
    }
}

}  // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const auto text = fuzz::textOf(data, size);
    write(text);
    const auto value = valueOf("LogLevel");
    fuzz::require(value == expectedOf(text, "LogLevel"), "the value of the key");
    if (value && value->size() < 10) {
        fuzz::require(base::decimalNumber(*value) == std::atoi(value->c_str()), "its number");
    }
    return 0;
}
