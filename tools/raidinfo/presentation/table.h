#pragma once

#include <string>

#include "codebook/code_book.h"
#include "inventory/value.h"
#include "listing/listing.h"
#include "presentation/grid.h"

namespace raidinfo {

/// The look of a value of a field, by what it says.
[[nodiscard]] Style styleOf(const Value& value, const Field* field);

/// The rows of a listing as a grid: numbers to the right, everything else to the left.
[[nodiscard]] std::string table(const Listing& listing, const GridLayout& layout,
                                const CodeBook& book);

/// The same with the kind in front of each row, for who reads the rows of several kinds.
[[nodiscard]] std::string namedTable(const Listing& listing, const GridLayout& layout,
                                     const CodeBook& book);

/// The same as `table` below the title of the kind and the number of rows; no grid if there are
/// none.
[[nodiscard]] std::string titledTable(const Listing& listing, const GridLayout& layout,
                                      const CodeBook& book);

}  // namespace raidinfo
