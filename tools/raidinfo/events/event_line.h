#pragma once

#include <string>

#include "inventory/records.h"

namespace raidinfo {

/// An event as one line for people.
[[nodiscard]] std::string eventLine(const Record& event);

}  // namespace raidinfo
