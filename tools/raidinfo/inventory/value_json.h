#pragma once

#include <nlohmann/json_fwd.hpp>

#include "inventory/value.h"

namespace raidinfo {

/// The value for programs, null where nobody knows it.
[[nodiscard]] nlohmann::ordered_json toJson(const Value& value);

}  // namespace raidinfo
