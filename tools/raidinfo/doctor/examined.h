#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

#include "exit_status.h"

namespace raidinfo {

/// What one check has found.
struct Examined {
    enum class Outcome : std::uint8_t { fine, noteworthy, bad };

    std::string_view key;
    std::string_view title;
    Outcome outcome;
    std::string finding;
    ExitStatus status = ExitStatus::ok;  ///< of the program, where the outcome is bad
};

[[nodiscard]] constexpr std::string_view wordOf(Examined::Outcome outcome) {
    constexpr auto words = std::to_array<std::string_view>({"ok", "look", "bad"});
    return words.at(static_cast<std::size_t>(outcome));
}

}  // namespace raidinfo
