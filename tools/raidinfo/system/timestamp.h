#pragma once

#include <string>

namespace raidinfo {

/// The present time in UTC, such as 2026-11-21T17:48:00Z. The environment's SOURCE_DATE_EPOCH, if
/// set, replaces it, for output that must be the same every time.
[[nodiscard]] std::string presentTimestamp();

}  // namespace raidinfo
