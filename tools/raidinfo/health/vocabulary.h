#pragma once

#include <cstdint>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace raidinfo::health {

/// The drives of an array, which are references to disk drives: a member that is gone has no
/// record.
constexpr std::string_view arrayMembers = "members";

/// What a field can be compared with.
enum class FieldType : std::uint8_t {
    number,  ///< a code, if the code book has codes for it
    count,   ///< a number that the policy counts
    flag,
    text,
    word,     ///< one of a few, or unknown
    numbers,  ///< nothing
};

/// A field that rules can speak of.
struct RuleField {
    std::string_view key;
    FieldType type;
    std::span<const std::string_view> words = {};
};

/// The kinds that rules can speak of.
[[nodiscard]] std::vector<std::string> ruleKinds();

/// What a record of such a kind can have: the fields of the library and those of the tree.
[[nodiscard]] std::vector<RuleField> ruleFields(std::string_view kind);

/// The kind whose codes the numbers of a record of this kind are.
[[nodiscard]] std::string_view kindOfCodes(std::string_view kind) noexcept;

}  // namespace raidinfo::health
