#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace raidinfo {

/// The columns that a printable UTF-8 text takes on a terminal.
[[nodiscard]] std::size_t displayWidth(std::string_view utf8) noexcept;

/// The text, cut with "…" where it takes more columns than there are.
[[nodiscard]] std::string shortened(std::string_view printable, std::size_t columns);

}  // namespace raidinfo
