#pragma once

#include <cstdint>
#include <nlohmann/json.hpp>
#include <string>
#include <string_view>
#include <vector>

#include "codebook/code_book.h"

namespace raidinfo::diff {

using Json = nlohmann::ordered_json;

/// Whether a change is for the worse. The change back has the opposite direction.
enum class Direction : std::uint8_t { neutral, worse, better };

enum class Type : std::uint8_t {
    changed,
    moved,     ///< its serial number is found at another place
    replaced,  ///< another serial number is found at its place
    added,
    removed,
};

/// One number of a place: "adapter_id" in JSON, "adapter 1" in a sentence.
struct Step {
    std::string_view key;
    std::string_view label;
    Json number;
};

/// Where a record is: the numbers from its adapter down to its own.
using Place = std::vector<Step>;

/// What has changed of a record; of one that was added or removed, what there is to say of it.
struct Detail {
    std::string key;  ///< that of the field, or what only the tree knows
    std::string title;
    Json before;  ///< null where there was no value
    Json after;
    Direction direction = Direction::neutral;
    std::string text;  ///< printable
};

/// Everything that has changed of one record.
struct Change {
    Type type;
    Direction direction;
    std::string_view kind;  ///< in JSON
    std::string_view noun;  ///< in a sentence
    Place place;            ///< of a record that was removed: where it was
    std::string origin;     ///< of one that moved: "moved from channel 1 device 3"
    Place former;           ///< of one that moved
    std::vector<Detail> details;
};

/// What changed in meaning between two trees, by place. Positions in lists have no meaning, nor has
/// the order of the records. The book gives codes their names and sizes their units; what a change
/// of a code is worth follows from the names. Throws SnapshotError for what is no tree.
[[nodiscard]] std::vector<Change> changes(const Json& before, const Json& after,
                                          const CodeBook& book);

/// One line for each change, as people read it.
[[nodiscard]] std::string told(const std::vector<Change>& changes);

/// The changes as the data of a JSON document.
[[nodiscard]] Json changesData(const std::vector<Change>& changes);

}  // namespace raidinfo::diff
