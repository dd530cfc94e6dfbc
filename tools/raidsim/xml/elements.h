#pragma once

#include <string_view>
#include <vector>

namespace raidsim::xml {

// The elements of that name in a well-formed text, each from its "<" to its last ">", in the order
// in which they begin. An element inside of another one of the same name belongs to that.
[[nodiscard]] std::vector<std::string_view> elementsOf(std::string_view wellFormed,
                                                       std::string_view name);

}  // namespace raidsim::xml
