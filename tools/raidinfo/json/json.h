#pragma once

#include <nlohmann/json_fwd.hpp>

#include "inventory/kinds.h"
#include "inventory/records.h"
#include "inventory/tree.h"
#include "inventory/value_json.h"
#include "listing/listing.h"

namespace raidinfo {

using Json = nlohmann::ordered_json;

/// The rows of a listing: a list of objects with a member for each column.
[[nodiscard]] Json rowsJson(const Listing& listing);

/// The trees: an object with the list of adapters, everything else nested.
[[nodiscard]] Json treeJson(const Group& roots);

/// The fields of an event.
[[nodiscard]] Json eventJson(const Record& event);

}  // namespace raidinfo
