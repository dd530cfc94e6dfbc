#pragma once

#include <cstddef>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "inventory/kinds.h"
#include "inventory/records.h"

namespace raidinfo {

/// The list that only the logical view has.
inline constexpr std::string_view hotSparesKey = "hot_spares";

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
    int number = 0;     ///< of the title
    Extras extras = {};
    std::string remark = {};         ///< the extras worth telling people
    const Kind* kind = nullptr;      ///< of the record
    const Record* record = nullptr;  ///< belongs to the snapshot; none where none is published
    std::optional<std::size_t> position = std::nullopt;  ///< of the record in its list
    bool inFull = true;  ///< false for a record that stands in full elsewhere in the tree
    std::vector<Group> groups = {};
};

/// Null where there is nothing under this key.
[[nodiscard]] const Value* findExtra(const Extras& extras, std::string_view key);

/// The value of a field of the tree. The holders are what the node belongs to, from the adapter
/// down.
[[nodiscard]] Value valueOf(const TreeField& field, const Node& node,
                            std::span<const Node* const> holders);

}  // namespace raidinfo
