#pragma once

#include <CLI/CLI.hpp>
#include <memory>
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

/// The command line with all its options and their explanations, from which it is parsed, explained
/// and completed. Its parts point to each other.
class Description {
public:
    Description();
    Description(const Description&) = delete;
    Description& operator=(const Description&) = delete;
    ~Description() = default;

    /// Throws what CLI11 throws.
    void parse(int argc, const char* const* argv);

    /// What was parsed, turned into options; usage Failures where the words make no sense.
    [[nodiscard]] Options options() const;

    [[nodiscard]] const CLI::App& app() const noexcept { return *parser; }

private:
    Words words;
    std::unique_ptr<CLI::App> parser;
};

/// The subcommands' names, separated by commas.
[[nodiscard]] std::string subcommandNames();

/// The kinds' keys, separated by commas.
[[nodiscard]] std::string kindNames();

// What an option's value is, by which completion knows what to offer.
namespace value_type {
inline constexpr auto kind = "KIND";
inline constexpr auto columns = "COLUMNS";
inline constexpr auto file = "FILE";
inline constexpr auto when = "WHEN";
inline constexpr auto filter = "FILTER";
}  // namespace value_type

/// The values of value_type::when.
[[nodiscard]] std::vector<std::string> colorChoices();

}  // namespace raidinfo
