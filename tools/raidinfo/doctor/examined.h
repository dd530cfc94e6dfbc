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

inline constexpr auto outcomeWords = std::to_array<std::string_view>({"ok", "look", "bad"});

[[nodiscard]] constexpr std::string_view wordOf(Examined::Outcome outcome) {
    return outcomeWords.at(static_cast<std::size_t>(outcome));
}

}  // namespace raidinfo
