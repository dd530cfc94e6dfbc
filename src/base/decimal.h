#pragma once

#include <limits>
#include <string_view>

namespace raid::base {

/// The number that the text begins with, read as strtol reads it in base 10 (leading white space
/// and a sign allowed, no digits give 0) and clamped to 32 bits in every build.
[[nodiscard]] int anyDecimalNumber(std::string_view text) noexcept;

/// The same, sooner where the text is what it is nearly always: a few digits.
[[nodiscard]] inline int decimalNumber(std::string_view text) noexcept {
    if (text.size() > std::numeric_limits<int>::digits10) {
        return anyDecimalNumber(text);
    }
    int number = 0;
    for (const char c : text) {
        if (c < '0' || c > '9') {
            return anyDecimalNumber(text);
        }
        number = number * 10 + (c - '0');
    }
    return number;
}

}  // namespace raid::base
