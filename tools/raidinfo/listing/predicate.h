#pragma once

#include <functional>

#include "codebook/code_book.h"
#include "inventory/value.h"
#include "listing/filter.h"

namespace raidinfo {

/// Whether a value of the column fulfils a filter.
using Predicate = std::function<bool(const Value&)>;

/// What the filter says of a column whose numbers mean this (null: nothing). A value that nothing
/// in the column could be compared with is a usage Failure.
[[nodiscard]] Predicate predicateOf(const Filter& filter, Shape shape,
                                    const CodeBook::Meaning* meaning);

}  // namespace raidinfo
