#pragma once

#include "../model/system_and_adapter.h"

/// Asks the service for the configuration and rebuilds the twelve inventory lists from it; without
/// a configuration they stay as they are. Clears refresh. Returns 0. Exceptions such as
/// std::bad_alloc pass through; the lists then hold what was published so far. For the inventory
/// thread.
[[gnu::visibility("default")]] int getConfig();

namespace raid::flat {

/// Rebuilds the twelve inventory lists from a configuration.
void publish(const RAIDSystem& system);

}  // namespace raid::flat
