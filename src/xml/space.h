#pragma once

#include <array>

namespace raid::xml {

/// True at the byte values that count as space in agent documents: 0 to 32, 127 to 160 and 255.
inline constexpr auto spaceBytes = [] {
    std::array<bool, 256> spaces{};
    for (std::size_t byte = 0; byte < spaces.size(); ++byte) {
        spaces[byte] = byte <= 32 || (byte >= 127 && byte <= 160) || byte == 255;
    }
    return spaces;
}();

[[nodiscard]] constexpr bool isSpaceByte(char c) noexcept {
    return spaceBytes[static_cast<unsigned char>(c)];
}

}  // namespace raid::xml
