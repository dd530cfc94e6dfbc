#pragma once

#include <chrono>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace raidsim {

// A 32-bit decimal number that fills the whole text, or nothing.
[[nodiscard]] std::optional<int> parseInt(std::string_view text) noexcept;

// A decimal number of seconds, perhaps with a fraction, up to a million; or nothing.
[[nodiscard]] std::optional<std::chrono::milliseconds> parseSeconds(std::string_view text) noexcept;

[[nodiscard]] std::string_view trim(std::string_view text) noexcept;
[[nodiscard]] std::vector<std::string_view> split(std::string_view text, char separator);
[[nodiscard]] bool equalIgnoringCase(std::string_view left, std::string_view right) noexcept;

}  // namespace raidsim
