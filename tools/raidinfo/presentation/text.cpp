#include "presentation/text.h"

#include <algorithm>
#include <array>
#include <cctype>
#include <charconv>
#include <cstdint>
#include <optional>
#include <utility>

namespace raidinfo {
namespace {

constexpr std::string_view replacement = "\uFFFD";
constexpr char32_t lastCodePoint = 0x10FFFF;

/// The first code point of a text and the bytes it takes; no code point where the bytes are not
/// UTF-8, and then the bytes are those to be replaced as one.
struct Decoded {
    std::optional<char32_t> codePoint;
    std::size_t length = 0;
};

struct LeadByte {
    unsigned char first, last;           ///< of the range of lead bytes
    unsigned char secondMin, secondMax;  ///< excludes overlong forms, surrogates, too large values
    std::size_t length;
    unsigned char payload;
};

constexpr auto leadBytes = std::to_array<LeadByte>({
    {0xC2, 0xDF, 0x80, 0xBF, 2, 0x1F},
    {0xE0, 0xE0, 0xA0, 0xBF, 3, 0x0F},
    {0xE1, 0xEC, 0x80, 0xBF, 3, 0x0F},
    {0xED, 0xED, 0x80, 0x9F, 3, 0x0F},
    {0xEE, 0xEF, 0x80, 0xBF, 3, 0x0F},
    {0xF0, 0xF0, 0x90, 0xBF, 4, 0x07},
    {0xF1, 0xF3, 0x80, 0xBF, 4, 0x07},
    {0xF4, 0xF4, 0x80, 0x8F, 4, 0x07},
});

unsigned char byteAt(std::string_view text, std::size_t index) {
    return static_cast<unsigned char>(text[index]);
}

Decoded firstCodePoint(std::string_view text) {
    const unsigned char first = byteAt(text, 0);
    if (first < 0x80) {
        return {first, 1};
    }
    const auto lead = std::ranges::find_if(leadBytes, [first](const LeadByte& row) {
        return row.first <= first && first <= row.last;
    });
    if (lead == leadBytes.end()) {
        return {std::nullopt, 1};
    }
    auto codePoint = static_cast<char32_t>(first & lead->payload);
    for (std::size_t index = 1; index < lead->length; ++index) {
        const unsigned char least = index == 1 ? lead->secondMin : 0x80;
        const unsigned char most = index == 1 ? lead->secondMax : 0xBF;
        if (index == text.size() || byteAt(text, index) < least || byteAt(text, index) > most) {
            return {std::nullopt, index};
        }
        codePoint = (codePoint << 6U) | (byteAt(text, index) & 0x3FU);
    }
    return {codePoint, lead->length};
}

void appendUtf8(std::string& text, char32_t codePoint) {
    const auto byte = [&text](char32_t value) { text += static_cast<char>(value); };
    if (codePoint < 0x80) {
        byte(codePoint);
        return;
    }
    if (codePoint < 0x800) {
        byte(0xC0 | codePoint >> 6U);
    } else if (codePoint < 0x10000) {
        byte(0xE0 | codePoint >> 12U);
        byte(0x80 | (codePoint >> 6U & 0x3F));
    } else {
        byte(0xF0 | codePoint >> 18U);
        byte(0x80 | (codePoint >> 12U & 0x3F));
        byte(0x80 | (codePoint >> 6U & 0x3F));
    }
    byte(0x80 | (codePoint & 0x3F));
}

constexpr auto predefinedEntities = std::to_array<std::pair<std::string_view, char32_t>>({
    {"amp", U'&'},
    {"lt", U'<'},
    {"gt", U'>'},
    {"quot", U'"'},
    {"apos", U'\''},
});

/// The character that a reference stands for; `name` is what stands between "&" and ";".
std::optional<char32_t> referenced(std::string_view name) {
    if (!name.starts_with('#')) {
        const auto found = std::ranges::find(predefinedEntities, name,
                                             &std::pair<std::string_view, char32_t>::first);
        return found == predefinedEntities.end() ? std::nullopt : std::optional{found->second};
    }
    name.remove_prefix(1);
    const bool hexadecimal = name.starts_with('x');
    name.remove_prefix(hexadecimal ? 1 : 0);
    std::uint32_t value = 0;
    const char* const end = name.data() + name.size();
    const auto [stop, error] = std::from_chars(name.data(), end, value, hexadecimal ? 16 : 10);
    const bool surrogate = value >= 0xD800 && value <= 0xDFFF;
    if (error != std::errc{} || stop != end || value == 0 || value > lastCodePoint || surrogate) {
        return std::nullopt;
    }
    return value;
}

/// Longer names cannot be references that are decoded ("&#x10FFFF;" with some leading zeros).
constexpr std::size_t longestReference = 16;

struct CodePointRange {
    char32_t first, last;
};

constexpr auto zeroWidth = std::to_array<CodePointRange>(
    {{0x300, 0x36F}, {0x200B, 0x200F}, {0x20D0, 0x20F0}, {0xFE00, 0xFE0F}, {0xFE20, 0xFE2F}});
constexpr auto doubleWidth = std::to_array<CodePointRange>({{0x1100, 0x115F},
                                                            {0x2E80, 0xA4CF},
                                                            {0xAC00, 0xD7A3},
                                                            {0xF900, 0xFAFF},
                                                            {0xFE30, 0xFE6F},
                                                            {0xFF00, 0xFF60},
                                                            {0xFFE0, 0xFFE6},
                                                            {0x1F300, 0x1FAFF},
                                                            {0x20000, 0x3FFFD}});

template <typename Ranges>
bool contains(const Ranges& ranges, char32_t codePoint) {
    return std::ranges::any_of(ranges, [codePoint](const CodePointRange& range) {
        return range.first <= codePoint && codePoint <= range.last;
    });
}

/// Most texts are: printable ASCII, each byte a column.
bool isPlain(std::string_view text) noexcept {
    return std::ranges::all_of(text, [](char byte) { return byte >= ' ' && byte <= '~'; });
}

std::size_t widthOf(char32_t codePoint) {
    if (contains(zeroWidth, codePoint)) {
        return 0;
    }
    return contains(doubleWidth, codePoint) ? 2 : 1;
}

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

std::string decoded(std::string_view sent) {
    if (std::ranges::all_of(sent, [](char byte) { return byte > 0 && byte != '&'; })) {
        return std::string{sent};
    }
    std::string result;
    result.reserve(sent.size());
    while (!sent.empty()) {
        if (sent.front() == '&') {
            const std::size_t end = sent.substr(0, longestReference).find(';');
            if (end != std::string_view::npos) {
                if (const auto character = referenced(sent.substr(1, end - 1))) {
                    appendUtf8(result, *character);
                    sent.remove_prefix(end + 1);
                    continue;
                }
            }
        }
        const auto [codePoint, length] = firstCodePoint(sent);
        result += codePoint ? sent.substr(0, length) : replacement;
        sent.remove_prefix(length);
    }
    return result;
}

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

std::string shortened(std::string_view printable, std::size_t columns) {
    if (displayWidth(printable) <= columns) {
        return std::string{printable};
    }
    std::size_t width = 1;  // of the sign that something is cut
    std::size_t kept = 0;
    while (kept < printable.size()) {
        const auto [codePoint, length] = firstCodePoint(printable.substr(kept));
        width += widthOf(codePoint.value_or(U'\uFFFD'));
        if (width > columns) {
            break;
        }
        kept += length;
    }
    return std::string{printable.substr(0, kept)} + (columns == 0 ? "" : "…");
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

std::size_t displayWidth(std::string_view utf8) noexcept {
    if (isPlain(utf8)) {
        return utf8.size();
    }
    std::size_t width = 0;
    while (!utf8.empty()) {
        const auto [codePoint, length] = firstCodePoint(utf8);
        width += widthOf(codePoint.value_or(U'\uFFFD'));
        utf8.remove_prefix(length);
    }
    return width;
}

}  // namespace raidinfo
