#include "text/width.h"

#include <algorithm>
#include <array>

#include "text/utf8.h"

namespace raidinfo {
namespace {

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

std::size_t widthOf(char32_t codePoint) {
    if (contains(zeroWidth, codePoint)) {
        return 0;
    }
    return contains(doubleWidth, codePoint) ? 2 : 1;
}

/// The bytes of the code points at the beginning that fit into so many columns.
std::size_t bytesIn(std::string_view printable, std::size_t columns) {
    std::size_t width = 0;
    std::size_t bytes = 0;
    while (bytes < printable.size()) {
        const auto [codePoint, length] = firstCodePoint(printable.substr(bytes));
        width += widthOf(codePoint.value_or(replacementCharacter));
        if (width > columns) {
            break;
        }
        bytes += length;
    }
    return bytes;
}

}  // namespace

std::size_t displayWidth(std::string_view utf8) noexcept {
    if (isPlain(utf8)) {
        return utf8.size();
    }
    std::size_t width = 0;
    while (!utf8.empty()) {
        const auto [codePoint, length] = firstCodePoint(utf8);
        width += widthOf(codePoint.value_or(replacementCharacter));
        utf8.remove_prefix(length);
    }
    return width;
}

std::string shortened(std::string_view printable, std::size_t columns) {
    if (displayWidth(printable) <= columns) {
        return std::string{printable};
    }
    return columns == 0 ? ""
                        : std::string{printable.substr(0, bytesIn(printable, columns - 1))} + "…";
}

std::vector<std::string> folded(std::string_view beginning, std::string_view printable,
                                std::size_t columns) {
    std::vector<std::string> lines;
    std::string start = shortened(beginning, columns / 2);
    const std::string indentation(displayWidth(start), ' ');
    do {
        const std::size_t room = columns - indentation.size();
        std::size_t end = bytesIn(printable, room);
        if (end == 0 && !printable.empty()) {
            end = firstCodePoint(printable).length;  // Without any room, too, it comes to an end.
        }
        if (const std::size_t space = printable.rfind(' ', end);
            end < printable.size() && space != std::string_view::npos && space > 0) {
            end = space;
        }
        const std::string_view part = printable.substr(0, end);
        lines.push_back(start + std::string{part.substr(0, part.find_last_not_of(' ') + 1)});
        printable.remove_prefix(std::min(printable.find_first_not_of(' ', end), printable.size()));
        start = indentation;
    } while (!printable.empty());
    return lines;
}

}  // namespace raidinfo
