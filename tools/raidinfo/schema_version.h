#pragma once

#include <string_view>

namespace raidinfo {

/// Of what --json prints. A member that is renamed or removed, or changes its meaning, makes it a
/// new first number.
inline constexpr std::string_view schemaVersion = "1.0";

/// What stands in front of the first dot; snapshots of another one mean something else.
[[nodiscard]] constexpr std::string_view majorVersion(std::string_view version) {
    return version.substr(0, version.find('.'));
}

}  // namespace raidinfo
