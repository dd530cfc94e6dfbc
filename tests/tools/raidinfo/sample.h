#pragma once

#include <map>
#include <string_view>

#include "inventory/records.h"

namespace raidinfo::test {

// A record with these values; the other fields are 0, false or empty.
[[nodiscard]] Record sample(const Kind& kind, const std::map<std::string_view, Value>& values);

}  // namespace raidinfo::test
