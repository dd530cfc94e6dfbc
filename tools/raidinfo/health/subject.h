#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

#include "inventory/records.h"
#include "inventory/tree.h"

namespace raidinfo::health {

/// A record as rules look at it. Its nodes belong to the tree.
struct Subject {
    std::string_view kind;           ///< as rules call it
    const Node* node;                ///< its place in the tree
    const Node* drive = nullptr;     ///< the drive that a member of an array is
    std::vector<std::size_t> above;  ///< the subjects that it stands below, outermost first
    Extras places;                   ///< the numbers of what it belongs to, as listings name them
    std::string address;             ///< "adapter 1, channel 1, disk drive 3, serial QS0103000K"

    /// The value of a field, also of one that only the tree knows; null where there is none.
    [[nodiscard]] const Value* find(std::string_view field) const;
};

/// All records of the trees, each once, in the order of the trees.
[[nodiscard]] std::vector<Subject> subjectsOf(const Group& adapters);

}  // namespace raidinfo::health
