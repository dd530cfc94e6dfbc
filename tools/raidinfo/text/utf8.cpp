#include "text/utf8.h"

#include <algorithm>
#include <array>

namespace raidinfo {
namespace {

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

}  // namespace

CodePoint firstCodePoint(std::string_view text) {
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

bool isPlain(std::string_view text) noexcept {
    return std::ranges::all_of(text, [](char byte) { return byte >= ' ' && byte <= '~'; });
}

}  // namespace raidinfo
