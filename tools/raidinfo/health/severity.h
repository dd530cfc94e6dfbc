#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>

namespace raidinfo::health {

/// The states of monitoring plugins; each is the exit status by which they tell it.
enum class Severity : std::uint8_t { ok, warning, critical, unknown };

constexpr auto severityWords =
    std::to_array<std::string_view>({"ok", "warning", "critical", "unknown"});

[[nodiscard]] constexpr std::string_view word(Severity severity) {
    return severityWords[static_cast<std::size_t>(severity)];
}

/// Which of two findings decides: what is known to be bad asks for a deed, so something unknown
/// beside it does not hide it; but nothing is well while something is unknown.
[[nodiscard]] constexpr int gravity(Severity severity) {
    constexpr std::array gravities{0, 2, 3, 1};
    return gravities[static_cast<std::size_t>(severity)];
}

}  // namespace raidinfo::health
