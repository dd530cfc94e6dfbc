#pragma once

#include <vector>

#include "inventory/records.h"
#include "model/system_and_adapter.h"

namespace raidinfo {

/// The configuration as the library published it, and the model it was published from.
struct Inventory {
    Snapshot snapshot;
    std::vector<RAIDAdapter> adapters;
};

}  // namespace raidinfo
