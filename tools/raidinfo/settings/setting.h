#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <variant>
#include <vector>

namespace raidinfo::settings {

/// Where something stands, for whoever has to correct it.
struct Place {
    std::string file;
    std::size_t line = 0;
};

struct Setting;
struct Entry;
using List = std::vector<Setting>;
using Table = std::vector<Entry>;  ///< in the order of the file

/// A value of a file that people write.
struct Setting {
    Place place;
    std::variant<bool, std::int64_t, std::string, List, Table> value;
};

struct Entry {
    std::string key;
    Setting setting;
};

/// "health.toml:12"
[[nodiscard]] std::string shown(const Place& place);

/// The Failure of a file that is wrong at this place.
[[noreturn]] void refuse(const Place& place, const std::string& problem);

/// The same for a word that is none of those known there.
[[noreturn]] void refuseUnknown(const Place& place, const std::string& what,
                                const std::string& word, const std::vector<std::string>& known);

/// What a setting holds; another type is a Failure.
[[nodiscard]] bool flagOf(const Setting& setting);
[[nodiscard]] int numberOf(const Setting& setting);
[[nodiscard]] const std::string& textOf(const Setting& setting);
[[nodiscard]] const Table& tableOf(const Setting& setting);
[[nodiscard]] const List& listOf(const Setting& setting);

}  // namespace raidinfo::settings
