#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "presentation/painter.h"

namespace raidinfo {

struct Cell {
    std::string text;  ///< printable
    Style style = Style::plain;
};

struct GridColumn {
    std::string title;
    bool toTheRight = false;
    std::vector<Cell> cells;
};

struct GridLayout {
    bool headings = true;
    std::optional<std::size_t> width = std::nullopt;  ///< to fold the grid to
    Painter painter{false};
};

/// Columns of equally many cells, side by side. What is wider than the layout is folded into
/// several grids below each other, each of which begins with the first column; a column that is too
/// wide by itself stays as it is, for a shortened serial number is none.
[[nodiscard]] std::string drawn(const std::vector<GridColumn>& columns, const GridLayout& layout);

}  // namespace raidinfo
