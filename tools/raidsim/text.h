#pragma once

#include <chrono>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace raidsim {

// A 32-bit decimal number that fills the whole text, or nothing.
[[nodiscard]] std::optional<int> parseInt(std::string_view text) noexcept;

// A decimal number without a sign that fills the whole text, or nothing.
[[nodiscard]] std::optional<std::uint64_t> parseCount(std::string_view text) noexcept;

// What parseSeconds() takes, for who must say that a word is "not " that.
inline constexpr std::string_view secondsForm =
    "a time of 0 to 1000000 seconds with at most three decimals";
[[nodiscard]] std::optional<std::chrono::milliseconds> parseSeconds(std::string_view text) noexcept;

// A time such as 12 or 12.5, without the zeros that tell nothing.
[[nodiscard]] std::string formatSeconds(std::chrono::milliseconds time);

// UTC, such as 2026-11-21T17:48:00Z; nothing for what is not of this form, or no day of the
// calendar.
[[nodiscard]] std::optional<std::chrono::sys_seconds> parseUtc(std::string_view text) noexcept;
[[nodiscard]] std::string formatUtc(std::chrono::sys_seconds when);

[[nodiscard]] std::string_view trim(std::string_view text) noexcept;
[[nodiscard]] std::vector<std::string_view> split(std::string_view text, char separator);
[[nodiscard]] bool equalIgnoringCase(std::string_view left, std::string_view right) noexcept;

}  // namespace raidsim
