#pragma once

#include <optional>
#include <span>
#include <string>
#include <string_view>

#include "diff/diff.h"
#include "diff/subjects.h"

namespace raidinfo::diff {

/// How bad it is what a word says: a text, a flag in words, or the name of a code.
struct Grade {
    std::string_view word;
    int badness;
};

/// How a field is told and judged. A field without a rule is told by its title and is neutral.
struct Rule {
    std::string_view key = {};
    std::optional<SubjectId> of = {};           ///< none: of whatever has such a field
    std::optional<std::string_view> lead = {};  ///< instead of the title
    std::string_view begins = {};               ///< said of a flag instead of its values
    std::string_view ends = {};
    std::span<const Grade> grades = {};
    bool followsHolder = false;  ///< repeats the number of an array that lists the record, or is 0
};

/// The rule for a field. Rules stand in the order in which fields are told.
[[nodiscard]] const Rule& ruleOf(const Subject& subject, std::string_view key);

/// What comes first is told first.
[[nodiscard]] std::size_t rankOf(const Rule& rule) noexcept;

/// Whether the second of two values is worse than the first, by the words for them.
[[nodiscard]] Direction direction(const Rule& rule, const std::optional<std::string>& before,
                                  const std::optional<std::string>& after);

}  // namespace raidinfo::diff
