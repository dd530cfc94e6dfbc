#pragma once

#include <array>
#include <cstddef>

namespace raid::xml {

/// Which of the 256 bytes are meant.
using ByteSet = std::array<bool, 256>;

template <class Includes>
constexpr ByteSet bytesThat(Includes includes) {
    ByteSet set{};
    for (std::size_t byte = 0; byte < set.size(); ++byte) {
        set[byte] = includes(byte);
    }
    return set;
}

[[nodiscard]] constexpr bool contains(const ByteSet& set, char c) noexcept {
    return set[static_cast<unsigned char>(c)];
}

/// The byte values that count as space in agent documents: 0 to 32, 127 to 160 and 255.
inline constexpr ByteSet spaceBytes = bytesThat(
    [](std::size_t byte) { return byte <= 32 || (byte >= 127 && byte <= 160) || byte == 255; });

[[nodiscard]] constexpr bool isSpaceByte(char c) noexcept { return contains(spaceBytes, c); }

}  // namespace raid::xml
