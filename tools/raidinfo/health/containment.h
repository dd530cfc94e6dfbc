#pragma once

#include <string_view>

#include "health/policy.h"

namespace raidinfo::health {

[[nodiscard]] bool isArray(std::string_view kind) noexcept;

/// Whether records of the kind `of` can stand within the adapter or the array of one of the kind
/// `on`; that array is the innermost, or the record itself.
[[nodiscard]] bool canBeWithin(std::string_view of, Count::Within within,
                               std::string_view on) noexcept;

}  // namespace raidinfo::health
