#pragma once

#include <string_view>

namespace raid::base {

/// The number that the text begins with, read as strtol reads it in base 10 (leading white space
/// and a sign allowed, no digits give 0) and clamped to 32 bits in every build.
[[nodiscard]] int decimalNumber(std::string_view text) noexcept;

}  // namespace raid::base
