#include "health/containment.h"

#include <algorithm>
#include <array>

#include "health/vocabulary.h"
#include "inventory/kinds.h"

namespace raidinfo::health {
namespace {

std::string_view keyOf(KindId id) noexcept { return kindOf(id).key; }

/// Spanned arrays span arrays of either kind; the drives are members of those at the bottom.
bool standsDirectlyIn(KindId array, std::string_view kind) noexcept {
    return kind == keyOf(KindId::logicalDrive) ||
           (array == KindId::array ? kind == arrayMembers : isArray(kind));
}

bool standsIn(KindId array, std::string_view kind) noexcept {
    return standsDirectlyIn(array, kind) || kind == arrayMembers;
}

bool isArrayOf(KindId array, std::string_view kind) noexcept {
    return isArray(kind) ? kind == keyOf(array) : standsDirectlyIn(array, kind);
}

}  // namespace

bool isArray(std::string_view kind) noexcept {
    return kind == keyOf(KindId::array) || kind == keyOf(KindId::spannedArray);
}

bool canBeWithin(std::string_view of, Count::Within within, std::string_view on) noexcept {
    constexpr auto arrays = std::to_array({KindId::array, KindId::spannedArray});
    return within == Count::Within::adapter
               ? of != anyAdapter
               : std::ranges::any_of(arrays, [of, on](KindId array) {
                     return isArrayOf(array, on) && standsIn(array, of);
                 });
}

}  // namespace raidinfo::health
