#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "codebook/code_book.h"
#include "inventory/kinds.h"
#include "inventory/records.h"
#include "presentation/painter.h"

namespace raidinfo {

struct Node;

/// The children of one kind. JSON names the list, also an empty one; the drawing does not.
struct Group {
    std::string_view key;
    std::vector<Node> nodes;
};

/// What only the tree knows of a record, by key.
using Extras = std::vector<std::pair<std::string_view, Value>>;

/// One line of the tree.
struct Node {
    std::string title;  ///< "Channel 1", "Disk drive 3"
    Extras extras = {};
    std::string remark = {};         ///< the extras worth telling people
    const Kind* kind = nullptr;      ///< of the record
    const Record* record = nullptr;  ///< belongs to the snapshot; none where none is published
    std::optional<std::size_t> position = std::nullopt;  ///< of the record in its list
    bool inFull = true;  ///< false for a record that stands in full elsewhere in the tree
    std::vector<Group> groups = {};
};

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
