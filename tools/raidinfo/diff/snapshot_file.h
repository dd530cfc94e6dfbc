#pragma once

#include <nlohmann/json.hpp>
#include <stdexcept>
#include <string_view>

namespace raidinfo::diff {

/// Says in one printable line why a text cannot be compared.
class SnapshotError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

/// The tree inside a snapshot. Throws SnapshotError when the file is none, is of another major
/// version, or was not complete.
[[nodiscard]] nlohmann::ordered_json snapshotData(std::string_view fileText);

}  // namespace raidinfo::diff
