#pragma once

#include <array>
#include <string_view>

namespace raidinfo {

/// What the library calls an overall status, from good to bad. It has no word for any other number,
/// which is Unknown.
inline constexpr auto overallStatusWords =
    std::to_array<std::string_view>({"Normal", "Warning", "Critical"});

}  // namespace raidinfo
