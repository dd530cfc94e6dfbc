#pragma once

#include <cstdint>
#include <optional>
#include <span>
#include <string_view>

#include "inventory/kinds.h"

namespace raidinfo::diff {

/// What a tree consists of. Those around a record come before it.
enum class SubjectId : std::uint8_t {
    adapter,
    channel,
    diskDrive,
    enclosure,
    fan,
    powerSupply,
    temperatureSensor,
    array,
    spannedArray,
    logicalDrive,
};

inline constexpr std::size_t subjectCount = 10;

/// What is special about some of them.
struct Traits {
    bool listsMembers = false;  ///< has drives below it that stand in full elsewhere
    bool isPart = false;        ///< comes and goes with what it is in
    bool mayRepeat = false;     ///< may stand below several arrays
    std::string_view moved = "moved from";
};

struct Subject {
    SubjectId id;
    std::string_view key;              ///< in JSON
    std::string_view noun;             ///< in a sentence
    std::string_view label;            ///< before its number in a place
    std::string_view number;           ///< the field that numbers it
    std::string_view step;             ///< what that is called in a place
    std::optional<SubjectId> within;   ///< what it is numbered in
    std::span<const KindId> kinds;     ///< the kinds whose fields it has
    std::span<const SubjectId> lists;  ///< what stands below it
    Traits traits = {};
};

[[nodiscard]] std::span<const Subject, subjectCount> subjects() noexcept;
[[nodiscard]] const Subject& subjectOf(SubjectId id) noexcept;

/// The key of the list in which such records stand.
[[nodiscard]] std::string_view listKey(const Subject& subject) noexcept;

/// The list of the drives that belong to an array.
[[nodiscard]] std::string_view memberListKey() noexcept;

/// A field as the kinds describe it; none for what only the tree knows.
[[nodiscard]] const Field* fieldOf(const Subject& subject, std::string_view key) noexcept;

/// Whether the key leads to a list of records or of members below such a record.
[[nodiscard]] bool isList(const Subject& subject, std::string_view key) noexcept;

}  // namespace raidinfo::diff
