#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>

namespace raidinfo {

enum class ColorChoice : std::uint8_t { automatic, always, never };

/// What a descriptor leads to, as far as the presentation depends on it.
struct Terminal {
    bool cursorMoves = false;  ///< a terminal that understands control sequences
    bool colors = false;
    std::optional<std::size_t> width = std::nullopt;   ///< none where nobody counts columns
    std::optional<std::size_t> height = std::nullopt;  ///< likewise rows
};

/// Looks at the descriptor and at the environment's TERM and NO_COLOR. A colour that was asked for
/// outright overrules both.
[[nodiscard]] Terminal terminalOf(int descriptor, ColorChoice choice);

}  // namespace raidinfo
