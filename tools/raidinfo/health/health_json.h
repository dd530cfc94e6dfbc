#pragma once

#include <nlohmann/json.hpp>

#include "health/verdict.h"

namespace raidinfo::health {

/// The verdict for programs.
[[nodiscard]] nlohmann::ordered_json healthData(const Verdict& verdict);

}  // namespace raidinfo::health
