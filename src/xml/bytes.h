#pragma once

#include <bit>
#include <cstddef>
#include <cstring>
#include <limits>
#include <string_view>

#include "xml/space.h"

// Looking at bytes a machine word at a time, for what a document has most of: short texts, short
// names and, where it is indented, blanks. Everything here is what the plain loop over the bytes
// would find, and reads no byte at or behind the end.
namespace raid::xml {

using Word = std::size_t;

inline constexpr std::size_t wordBytes = sizeof(Word);

[[nodiscard]] inline Word wordAt(const char* at) noexcept {
    Word word = 0;
    std::memcpy(&word, at, wordBytes);
    return word;
}

/// The word that holds the byte everywhere.
[[nodiscard]] constexpr Word everywhere(unsigned char byte) noexcept {
    return std::numeric_limits<Word>::max() / std::numeric_limits<unsigned char>::max() * byte;
}

/// The bytes between two positions.
[[nodiscard]] inline std::size_t between(const char* from, const char* to) noexcept {
    return static_cast<std::size_t>(to - from);
}

/// The first byte that is no space, or the end.
[[nodiscard]] inline const char* passSpace(const char* at, const char* end) noexcept {
    // Indentation is a line feed and blanks.
    if (at != end && *at == '\n') {
        ++at;
    }
    while (between(at, end) >= wordBytes && wordAt(at) == everywhere(' ')) {
        at += wordBytes;
    }
    while (at != end && isSpaceByte(*at)) {
        ++at;
    }
    return at;
}

/// The first "<", or the end.
[[nodiscard]] inline const char* findTag(const char* at, const char* end) noexcept {
    if constexpr (std::endian::native == std::endian::little) {
        for (; between(at, end) >= wordBytes; at += wordBytes) {
            // A byte that became zero borrows from above; of the marks the lowest is true.
            const Word different = wordAt(at) ^ everywhere('<');
            const Word marks = (different - everywhere(0x01)) & ~different & everywhere(0x80);
            if (marks != 0) {
                constexpr int bitsOfByte = std::numeric_limits<unsigned char>::digits;
                return at + std::countr_zero(marks) / bitsOfByte;
            }
        }
    }
    while (at != end && *at != '<') {
        ++at;
    }
    return at;
}

/// The text without the space around it.
[[nodiscard]] inline std::string_view trimmed(std::string_view text) noexcept {
    while (!text.empty() && isSpaceByte(text.front())) {
        text.remove_prefix(1);
    }
    while (!text.empty() && isSpaceByte(text.back())) {
        text.remove_suffix(1);
    }
    return text;
}

/// Whether a name stands at a position that has room for it. Names are too short for memcmp to pay.
[[nodiscard]] inline bool standsAt(const char* at, std::string_view name) noexcept {
    if (name.size() < wordBytes) {
        return std::string_view(at, name.size()) == name;
    }
    // The last word overlaps the one before it.
    const std::size_t last = name.size() - wordBytes;
    for (std::size_t offset = 0; offset < last; offset += wordBytes) {
        if (wordAt(at + offset) != wordAt(name.data() + offset)) {
            return false;
        }
    }
    return wordAt(at + last) == wordAt(name.data() + last);
}

}  // namespace raid::xml
