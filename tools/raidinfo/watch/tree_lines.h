#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "codebook/code_book.h"
#include "inventory/tree.h"

namespace raidinfo {

/// A line of the watched tree.
struct TreeLine {
    enum class Change : std::uint8_t { none, changed, gone };

    std::string path;    ///< the titles down to it, by which the line is known again
    std::string margin;  ///< what joins it to the lines above
    std::string text;
    Change change = Change::none;
};

[[nodiscard]] std::vector<TreeLine> treeLines(const Group& roots, const CodeBook& book);

/// Marks what is new or reads otherwise than before, and adds what is gone as lines at the end.
/// Returns whether there is any.
bool markChanges(std::vector<TreeLine>& now, const std::vector<TreeLine>& before);

/// Marks again what was marked before, lest nobody have the time to see it.
void keepMarks(std::vector<TreeLine>& now, const std::vector<TreeLine>& before);

}  // namespace raidinfo
