#pragma once

#include <stop_token>

#include "library/library.h"
#include "source/inventory.h"

namespace raidinfo {

/// Asks the service for the configuration. Fails with serviceUnavailable if no answer came and with
/// malformedAnswer if the library could not read it. If it was read before and no answer came, the
/// inventory is what it was. Once stop is requested the result means nothing.
[[nodiscard]] Inventory readInventory(const Library& library, const std::stop_token& stop);

}  // namespace raidinfo
