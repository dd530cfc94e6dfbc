#pragma once

#include <vector>

#include "codebook/code_book.h"
#include "diff/entries.h"

namespace raidinfo::diff {

/// What is different about a record, the weightiest first.
[[nodiscard]] std::vector<Detail> differences(const Entry& before, const Entry& after,
                                              const CodeBook& book);

/// What there is to say of a record that was added or removed: what the tree shows of it.
[[nodiscard]] std::vector<Detail> description(const Entry& entry, Type type, const CodeBook& book);

}  // namespace raidinfo::diff
