#pragma once

#include <array>
#include <deque>
#include <set>
#include <string>

#include "diff/diff.h"
#include "diff/subjects.h"

namespace raidinfo::diff {

/// One record of a tree and what the tree tells of it by listing it.
struct Entry {
    const Subject* subject;
    const Json* record;                  ///< belongs to the tree
    const Entry* within;                 ///< what it is numbered in; none for an adapter
    std::set<std::string> holders = {};  ///< the arrays that list it: "array 0"
    std::set<std::string> missing = {};  ///< members that it lists and no channel has
    /// Equal in both trees for records that are the same, else unique. Given by the matching.
    std::string identity = {};

    [[nodiscard]] const Json& number() const { return *field(subject->number); }
    /// The field; null where the record has none.
    [[nodiscard]] const Json* field(std::string_view key) const;
    /// The number that a place has under this key; null where it has none.
    [[nodiscard]] const Json* placeNumber(std::string_view step) const;
    [[nodiscard]] Place place() const;
};

/// The records of a tree, those of each sort together.
class Entries {
public:
    /// Throws SnapshotError where the JSON has not the shape of a tree, which must outlive this.
    explicit Entries(const Json& tree);

    [[nodiscard]] std::deque<Entry>& of(SubjectId id) {
        return entries[static_cast<std::size_t>(id)];
    }

private:
    std::array<std::deque<Entry>, subjectCount> entries;
};

}  // namespace raidinfo::diff
