#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

#include "listing/listing.h"

namespace raidinfo {

/// Which columns a listing shows.
struct ColumnChoice {
    bool all = false;    ///< every column first
    bool chief = false;  ///< the chief columns first
    std::vector<std::string> keys = {};
};

/// Reads `KEY,KEY`, `+KEY,KEY` (besides the chief columns) or `all`. What is no such list is a
/// usage Failure; whether the kind has the columns shows in chosenColumns.
[[nodiscard]] ColumnChoice parseColumns(std::string_view text);

/// The chosen columns of the kind, by their place in columnsOf(kind); none is taken twice. A column
/// that the kind does not have is a usage Failure that names those it has.
[[nodiscard]] std::vector<std::size_t> chosenColumns(const ColumnChoice& choice, const Kind& kind);

}  // namespace raidinfo
