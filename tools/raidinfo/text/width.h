#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace raidinfo {

/// The columns that a printable UTF-8 text takes on a terminal.
[[nodiscard]] std::size_t displayWidth(std::string_view utf8) noexcept;

/// The text, cut with "…" where it takes more columns than there are.
[[nodiscard]] std::string shortened(std::string_view printable, std::size_t columns);

/// The text on as many lines as it takes, cut at its spaces where that can be. The first line
/// begins with this beginning, which is shortened to half of the columns, the others are indented
/// as far.
[[nodiscard]] std::vector<std::string> folded(std::string_view beginning,
                                              std::string_view printable, std::size_t columns);

}  // namespace raidinfo
