#pragma once

#include <CLI/CLI.hpp>
#include <cstdint>
#include <string>
#include <utility>
#include <vector>

namespace completion {

using Words = std::vector<std::string>;

/// How the words that are offered become a value.
enum class Form : std::uint8_t {
    file,   ///< the value is the name of a file
    word,   ///< the value is one of the words
    list,   ///< it is different words with commas between them, perhaps behind a "+"
    start,  ///< it starts with one of the words, and goes on without a blank
};

/// The values of a type.
struct Values {
    std::string type;  ///< as the help names it behind an option
    Form form;
    Words words = {};
    Words alone = {};  ///< of a list: that are a value by themselves only
    /// Other words where the subcommand's first operand is this one.
    std::vector<std::pair<std::string, Words>> wordsBehind = {};
};

/// A script for bash to source that completes the subcommands, the options, and the values and
/// operands of these types. No operand may be repeated, and options of one name take one type.
[[nodiscard]] std::string forBash(const CLI::App& app, const std::vector<Values>& values);

}  // namespace completion
