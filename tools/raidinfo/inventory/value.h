#pragma once

#include <compare>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

namespace raidinfo {

/// What nobody knows: a status for which the library has no text, or what the tree does not tell.
struct Unknown {
    auto operator<=>(const Unknown&) const = default;
};

/// What people read and write for it, and for a code without a name.
inline constexpr std::string_view unknownWord = "unknown";

/// A field as it was read, texts decoded.
using Value = std::variant<int, bool, std::string, Unknown, std::vector<int>>;

/// A value as people read it.
[[nodiscard]] std::string shown(const Value& value);

}  // namespace raidinfo
