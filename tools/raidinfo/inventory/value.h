#pragma once

#include <string>
#include <variant>
#include <vector>

namespace raidinfo {

/// A status text that the library does not know, hence no text.
struct UnknownStatus {
    bool operator==(const UnknownStatus&) const = default;
};

/// A field as it was read, texts decoded.
using Value = std::variant<int, bool, std::string, UnknownStatus, std::vector<int>>;

/// A value as people read it.
[[nodiscard]] std::string shown(const Value& value);

}  // namespace raidinfo
