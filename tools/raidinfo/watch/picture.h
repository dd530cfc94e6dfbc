#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include "presentation/painter.h"
#include "watch/tree_lines.h"

namespace raidinfo {

struct PictureLine {
    std::string text;
    Style style = Style::plain;
};

/// What is seen of the machine at a time: the tree, with "* " before what changed and "- " before
/// what is gone, also without colours, and what stands above and below it.
struct Picture {
    std::vector<PictureLine> above;
    std::vector<TreeLine> tree;
    std::vector<PictureLine> below;  ///< the latest last
};

/// Every line, however long.
[[nodiscard]] std::vector<PictureLine> wholePicture(const Picture& picture);

/// As many lines as there are rows, at most. What stands above and below the tree matters more than
/// the tree, and in that what changed, which is shown in full where there are rows, more than what
/// it belongs to, and that more than the rest. The lines of the tree that find no room are counted.
[[nodiscard]] std::vector<PictureLine> fittedPicture(const Picture& picture, std::size_t columns,
                                                     std::size_t rows);

}  // namespace raidinfo
