#include "base/decimal.h"

#include <algorithm>
#include <cstdint>
#include <limits>

namespace raid::base {
namespace {

constexpr std::string_view whiteSpace = " \t\n\v\f\r";

constexpr bool isDigit(char c) { return c >= '0' && c <= '9'; }

}  // namespace

int anyDecimalNumber(std::string_view text) noexcept {
    text.remove_prefix(std::min(text.find_first_not_of(whiteSpace), text.size()));
    const bool negative = text.starts_with('-');
    if (negative || text.starts_with('+')) {
        text.remove_prefix(1);
    }
    // One more than the largest int is the magnitude of the smallest.
    constexpr std::int64_t largest = std::numeric_limits<int>::max();
    std::int64_t magnitude = 0;
    for (const char c : text) {
        if (!isDigit(c)) {
            break;
        }
        magnitude = std::min(magnitude * 10 + (c - '0'), largest + 1);
    }
    return static_cast<int>(negative ? -magnitude : std::min(magnitude, largest));
}

}  // namespace raid::base
