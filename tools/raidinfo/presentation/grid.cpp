#include "presentation/grid.h"

#include <algorithm>
#include <cstddef>
#include <span>

#include "text/width.h"

namespace raidinfo {
namespace {

constexpr std::size_t gap = 2;

struct Measured {
    const GridColumn* column;
    std::vector<std::size_t> widths;  ///< of the cells
    std::size_t width;                ///< of the widest
};

Measured measured(const GridColumn& column, bool headings) {
    Measured result{&column, {}, headings ? displayWidth(column.title) : 0};
    result.widths.reserve(column.cells.size());
    for (const Cell& cell : column.cells) {
        result.widths.push_back(displayWidth(cell.text));
        result.width = std::max(result.width, result.widths.back());
    }
    return result;
}

/// Builds one line; blanks are written before the next text only, so none ends a line.
class Line {
public:
    explicit Line(std::string& destination) : text{destination} {}

    void add(std::string_view painted, std::size_t shownWidth, std::size_t columnWidth,
             bool toTheRight) {
        const std::size_t rest = columnWidth - shownWidth;
        blanks += gap + (toTheRight ? rest : 0);
        if (!painted.empty()) {
            text.append(blanks, ' ').append(painted);
            blanks = 0;
        }
        blanks += toTheRight ? 0 : rest;
    }

    void end() {
        text += '\n';
        blanks = 0;
    }

private:
    std::string& text;
    std::size_t blanks = 0;
};

void drawBlock(const std::vector<const Measured*>& columns, const GridLayout& layout,
               std::string& drawing) {
    Line line{drawing};
    if (layout.headings) {
        for (const Measured* const column : columns) {
            const std::string& title = column->column->title;
            line.add(layout.painter(title, Style::heading), displayWidth(title), column->width,
                     column->column->toTheRight);
        }
        line.end();
    }
    const std::size_t rows = columns.front()->column->cells.size();
    for (std::size_t row = 0; row < rows; ++row) {
        for (const Measured* const column : columns) {
            const auto& [text, style] = column->column->cells[row];
            const auto add = [&](std::string_view painted) {
                line.add(painted, column->widths[row], column->width, column->column->toTheRight);
            };
            if (style == Style::plain) {
                add(text);
            } else {
                add(layout.painter(text, style));
            }
        }
        line.end();
    }
}

}  // namespace

std::string drawn(const std::vector<GridColumn>& columns, const GridLayout& layout) {
    std::vector<Measured> all;
    all.reserve(columns.size());
    for (const GridColumn& column : columns) {
        all.push_back(measured(column, layout.headings));
    }
    std::string drawing;
    for (std::size_t next = 0; next < all.size();) {
        const bool first = next == 0;
        std::vector<const Measured*> block{&all.front()};
        std::size_t width = gap + all.front().width;
        next = std::max<std::size_t>(next, 1);
        while (next < all.size() && (!layout.width || block.size() == 1 ||
                                     width + gap + all[next].width <= *layout.width)) {
            width += gap + all[next].width;
            block.push_back(&all[next++]);
        }
        drawing += first ? "" : "\n";
        drawBlock(block, layout, drawing);
    }
    return drawing;
}

}  // namespace raidinfo
