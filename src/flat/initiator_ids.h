#pragma once

#include <vector>

#include "model/system_and_adapter.h"

namespace raid::flat {

/// Writes the initiator IDs of the adapter's channels in order, separated by commas; an empty text
/// without channels or for a position outside the list.
void initiatorIDs(char* destination, const std::vector<RAIDAdapter>& list, int position) noexcept;

}  // namespace raid::flat
