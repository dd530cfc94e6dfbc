#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "settings/setting.h"

namespace raidinfo::settings {

/// Reads a table whose keys are known. What nobody has asked for is a mistake of the file's author,
/// most likely a misspelt key, and must not pass unnoticed.
class TableReader {
public:
    /// `what` names the table in failures: "rule \"fan-critical\"".
    TableReader(const Table& read, Place start, std::string what);

    /// None where the table does not have the key.
    [[nodiscard]] const Setting* find(std::string_view key);

    /// A table without the key is a Failure.
    [[nodiscard]] const Setting& need(std::string_view key);

    /// Fails when the table has a key that was not asked for.
    void finish() const;

private:
    const Table& table;
    Place place;
    std::string name;
    std::vector<std::string> known;
};

}  // namespace raidinfo::settings
