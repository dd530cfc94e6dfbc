#pragma once

#include <functional>
#include <string>

namespace raidinfo {

/// What the function makes of each item, with commas between: "a, b, c".
template <typename Items, typename Text = std::identity>
[[nodiscard]] std::string enumerated(const Items& items, const Text& textOf = {}) {
    std::string list;
    for (const auto& item : items) {
        list += list.empty() ? "" : ", ";
        list += std::invoke(textOf, item);
    }
    return list;
}

}  // namespace raidinfo
