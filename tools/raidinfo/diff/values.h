#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "codebook/code_book.h"
#include "diff/diff.h"
#include "diff/subjects.h"

namespace raidinfo::diff {

/// A field's value as people read it, "4 (failed)" or "70006 MB"; null for one that is not there.
[[nodiscard]] std::string shown(const Subject& subject, std::string_view key, const Json* value,
                                const CodeBook& book);

/// The word that a value is or that stands for it; none for a code without a name, and for what is
/// not there.
[[nodiscard]] std::optional<std::string> wordFor(const Subject& subject, std::string_view key,
                                                 const Json* value, const CodeBook& book);

}  // namespace raidinfo::diff
