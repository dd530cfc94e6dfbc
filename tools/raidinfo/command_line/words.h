#pragma once

#include <CLI/CLI.hpp>
#include <optional>
#include <string>
#include <vector>

#include "command_line/options.h"

namespace raidinfo {

/// The words of the command line as they were given.
struct Words {
    bool json = false;
    std::string color;
    std::string library;
    std::string recording;
    std::string codes;
    int timeout = 0;

    std::string kind;
    int position = 0;
    std::string columns;
    std::vector<std::string> filters;
    bool noHeadings = false;
    bool logical = false;
    int since = 0;
    int count = 0;
    std::string command;
    std::string state;
    int eventsInterval = 0;
    int interval = 0;
    bool explain = false;
    bool nagios = false;
    std::string policy;
    std::string file;
    std::string before;
    std::string after;
    bool redact = false;
    int duration = 0;
};

// What an option's value is, by which completion knows what to offer.
namespace value_type {
inline constexpr auto kind = "KIND";
inline constexpr auto columns = "COLUMNS";
inline constexpr auto file = "FILE";
inline constexpr auto when = "WHEN";
inline constexpr auto filter = "FILTER";
}  // namespace value_type

/// What a number may be, both ends included.
struct Bounds {
    int least;
    int most;
};

constexpr int longestSeconds = 86400;

/// An option that is a number; of several the last one counts.
CLI::Option* addNumber(CLI::App& app, const char* name, int& word, const char* meaning,
                       const char* type, Bounds bounds);

/// An operand that must not be empty: so a shell passes a variable that is not set, and it would
/// pass for no value at all.
CLI::Option* addFileOperand(CLI::App& app, const char* name, std::string& word,
                            const char* meaning);

/// The same as an option, of which the last one counts.
CLI::Option* addFile(CLI::App& app, const char* name, std::string& word, const char* meaning);

/// Refuses an empty word as addFileOperand does.
[[nodiscard]] CLI::Validator notEmpty();

/// Takes decimal digits alone, and as such: a 0 in front, as of a number that a script has padded,
/// would make octal ones of them.
[[nodiscard]] CLI::Validator between(Bounds bounds);

/// None for an empty word, which stands for an option that was not given.
[[nodiscard]] std::optional<std::filesystem::path> optionalPath(const std::string& word);

/// The time that --timeout gives, none where that is without end.
[[nodiscard]] std::optional<std::chrono::milliseconds> limitOf(const Words& words);

}  // namespace raidinfo
