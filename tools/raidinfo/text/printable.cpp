#include "text/printable.h"

#include <array>
#include <cctype>
#include <charconv>
#include <cstddef>
#include <cstdint>

#include "text/utf8.h"

namespace raidinfo {
namespace {

bool isControl(char32_t codePoint) {
    // The last two ranges reorder the text around them on a terminal.
    return codePoint < 0x20 || (codePoint >= 0x7F && codePoint < 0xA0) || codePoint == 0x2028 ||
           codePoint == 0x2029 || (codePoint >= 0x202A && codePoint <= 0x202E) ||
           (codePoint >= 0x2066 && codePoint <= 0x2069);
}

std::string escaped(char32_t codePoint) {
    std::array<char, 8> digits{};
    const auto value = static_cast<std::uint32_t>(codePoint);
    const auto end = std::to_chars(digits.data(), digits.data() + digits.size(), value, 16).ptr;
    return "\\u{" + std::string{digits.data(), end} + "}";
}

}  // namespace

std::string printable(std::string_view utf8) {
    if (isPlain(utf8)) {
        return std::string{utf8};
    }
    std::string result;
    result.reserve(utf8.size());
    while (!utf8.empty()) {
        const auto [codePoint, length] = firstCodePoint(utf8);
        if (codePoint && isControl(*codePoint)) {
            result += escaped(*codePoint);
        } else {
            result += utf8.substr(0, length);
        }
        utf8.remove_prefix(length);
    }
    return result;
}

std::string inSentence(std::string_view title) {
    const auto isUpper = [title](std::size_t index) {
        return index < title.size() && std::isupper(static_cast<unsigned char>(title[index])) != 0;
    };
    std::string result{title};
    if (isUpper(0) && !isUpper(1)) {
        result[0] = static_cast<char>(std::tolower(static_cast<unsigned char>(result[0])));
    }
    return result;
}

}  // namespace raidinfo
