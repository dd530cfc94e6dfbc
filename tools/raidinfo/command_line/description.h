#pragma once

#include <CLI/CLI.hpp>
#include <memory>
#include <string>
#include <vector>

#include "command_line/options.h"
#include "command_line/words.h"

namespace raidinfo {

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

/// The values of value_type::when.
[[nodiscard]] std::vector<std::string> colorChoices();

}  // namespace raidinfo
