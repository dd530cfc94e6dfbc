#pragma once

#include <string>

#include "kinds.h"
#include "records.h"

namespace raidinfo {

/// A value as people read it.
[[nodiscard]] std::string shown(const Value& value);

/// The records of a kind as a titled table: numbers to the right, everything else to the left.
[[nodiscard]] std::string table(const Kind& kind, const Records& records);

/// All tables of the inventory.
[[nodiscard]] std::string tables(const Snapshot& snapshot);

}  // namespace raidinfo
