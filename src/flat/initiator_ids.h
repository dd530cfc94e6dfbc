#pragma once

#include "model/system_and_adapter.h"

namespace raid::flat {

/// Writes the initiator IDs of the adapter's channels in order, separated by commas; an empty text
/// without channels or adapter.
void initiatorIDs(char* destination, const RAIDAdapter* adapter) noexcept;

}  // namespace raid::flat
