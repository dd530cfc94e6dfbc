#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "codebook/code_book.h"
#include "listing/listing.h"

namespace raidinfo {

/// A condition on a record: `KEY OPERATOR VALUE` without blanks around the operator.
struct Filter {
    enum class Comparison : std::uint8_t {
        notEqual,  ///< !=
        atMost,    ///< <=
        atLeast,   ///< >=
        equal,     ///< =
        less,      ///< <
        greater,   ///< >
        contains,  ///< ~
    };
    std::string key;
    Comparison comparison;
    std::string value;
};

/// Reads a condition such as `state!=0` or `vendor~QUIL`; anything else is a usage Failure.
[[nodiscard]] Filter parseFilter(std::string_view text);

/// Whether the kind has the column that the filter looks at.
[[nodiscard]] bool concerns(const Filter& filter, const Kind& kind) noexcept;

/// What no record of the kind could be compared with is a usage Failure, as is a column that the
/// kind does not have.
void checkFilters(const std::vector<Filter>& filters, const Kind& kind, const CodeBook& book);

/// The rows that fulfil all filters. Numbers compare as numbers, codes by their names, too, flags
/// with yes, no, true, false, 1 and 0, texts byte by byte, what is not known as "unknown", lists of
/// numbers number by number for "~" and as they are shown otherwise. Fails as checkFilters does.
[[nodiscard]] Listing filtered(Listing listing, const std::vector<Filter>& filters,
                               const CodeBook& book);

}  // namespace raidinfo
