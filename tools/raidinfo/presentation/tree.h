#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "codebook/code_book.h"
#include "inventory/tree.h"
#include "presentation/painter.h"

namespace raidinfo {

/// What is said in place of a drawing without a line.
inline constexpr std::string_view noAdapters = "No adapters";

/// One line of the drawing: what joins it to the lines above, and what it says.
struct DrawnLine {
    const Node* node;
    std::string margin;
    std::string text;
};

/// The lines of the trees from the top down; a node's children follow it.
[[nodiscard]] std::vector<DrawnLine> linesOf(const Group& roots, const CodeBook& book,
                                             const Painter& painter = Painter{false});

/// The trees as they are drawn for people.
[[nodiscard]] std::string drawn(const Group& roots, const CodeBook& book,
                                const Painter& painter = Painter{false});

}  // namespace raidinfo
