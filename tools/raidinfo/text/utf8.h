#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

namespace raidinfo {

/// Stands for bytes that are not UTF-8.
constexpr char32_t replacementCharacter = U'\uFFFD';

constexpr char32_t lastCodePoint = 0x10FFFF;

/// The first code point of a text and the bytes it takes; no code point where the bytes are not
/// UTF-8, and then the bytes are those to be replaced as one.
struct CodePoint {
    std::optional<char32_t> value;
    std::size_t length = 0;
};

/// Of a text that is not empty.
[[nodiscard]] CodePoint firstCodePoint(std::string_view text);

void appendUtf8(std::string& text, char32_t codePoint);

/// Whether the text is printable ASCII, each byte a column, as most texts are.
[[nodiscard]] bool isPlain(std::string_view text) noexcept;

}  // namespace raidinfo
