#pragma once

#include <span>
#include <string>

#include "command_line/words.h"

namespace raidinfo {

/// A subcommand: its name, its help, its options, and what is made of them.
struct Subcommand {
    const char* name = nullptr;
    const char* summary = nullptr;
    const char* examples = nullptr;
    void (*declare)(CLI::App&, Words&) = nullptr;
    CommandOptions (*read)(const CLI::App&, const Words&) = nullptr;
    const char* withoutRecording = nullptr;  ///< why --from is refused, where it is
};

/// In the order of CommandOptions.
[[nodiscard]] std::span<const Subcommand> allSubcommands() noexcept;

/// The kinds' keys, separated by commas.
[[nodiscard]] std::string kindNames();

/// The subcommands' names, separated by commas.
[[nodiscard]] std::string subcommandNames();

}  // namespace raidinfo
