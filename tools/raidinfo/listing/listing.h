#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

#include "inventory/kinds.h"
#include "inventory/records.h"
#include "inventory/tree.h"

namespace raidinfo {

/// A column that a kind's listing can have.
struct ListColumn {
    std::string_view key;
    std::string_view title;
    const Field* field;  ///< null for the position and for what only the tree knows
    Shape shape;
    bool chief;  ///< shown unless other columns are asked for
};

/// The records of a kind as rows: the position, what only the tree knows (such as a drive's device
/// ID), the fields.
struct Listing {
    const Kind* kind;
    std::vector<ListColumn> columns;
    std::vector<std::vector<Value>> rows;
};

/// All columns of a kind.
[[nodiscard]] std::vector<ListColumn> columnsOf(const Kind& kind);

/// Says that a kind has no such column, and which it has.
[[nodiscard]] std::string withoutColumn(const Kind& kind, std::string_view key);

/// The records of the kind in the order of their positions; the trees are those of the snapshot.
[[nodiscard]] Listing listingOf(const Kind& kind, const Snapshot& snapshot, const Group& trees);

/// The listing with these columns only, in this order.
[[nodiscard]] Listing withColumns(Listing listing, const std::vector<std::size_t>& columns);

}  // namespace raidinfo
