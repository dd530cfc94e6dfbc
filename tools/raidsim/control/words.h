#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace raidsim {

// Cuts a line at its blanks. Double quotes keep blanks, also in mid-word (string="Drive failed");
// inside them a backslash takes the next character as it is. Throws CommandError for an open
// quote.
[[nodiscard]] std::vector<std::string> splitWords(std::string_view line);

}  // namespace raidsim
