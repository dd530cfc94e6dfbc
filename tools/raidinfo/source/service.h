#pragma once

#include <functional>
#include <stop_token>
#include <vector>

#include "library.h"
#include "model/system_and_adapter.h"
#include "records.h"

namespace raidinfo {

/// The configuration as the library published it, and the model it was published from.
struct Inventory {
    Snapshot snapshot;
    std::vector<RAIDAdapter> adapters;
};

/// Asks for the configuration. Fails with serviceUnavailable if no answer came and with
/// malformedAnswer if the library could not read it. Once stop is requested the result means
/// nothing.
[[nodiscard]] Inventory readInventory(const Library& library, const std::stop_token& stop);

/// Hands every event from the service's newest on to `show`, each once, until stop is requested.
/// Fails like readInventory.
void followEvents(const Library& library, const std::function<void(const Records&)>& show,
                  const std::stop_token& stop);

}  // namespace raidinfo
