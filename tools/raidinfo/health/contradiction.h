#pragma once

#include <string>
#include <vector>

#include "health/condition.h"

namespace raidinfo::health {

/// Those of the conditions that no value of their field fulfils together, in words; empty where
/// there are none. The names of a field without codes count for nothing: the code book may have
/// them again.
[[nodiscard]] std::string contradictionIn(const std::vector<Condition>& conditions);

}  // namespace raidinfo::health
