#include "settings/table_reader.h"

#include <algorithm>
#include <utility>

namespace raidinfo::settings {

TableReader::TableReader(const Table& read, Place start, std::string what)
    : table{read}, place{std::move(start)}, name{std::move(what)} {}

const Setting* TableReader::find(std::string_view key) {
    known.emplace_back(key);
    const auto found = std::ranges::find(table, key, &Entry::key);
    return found == table.end() ? nullptr : &found->setting;
}

const Setting& TableReader::need(std::string_view key) {
    const Setting* const found = find(key);
    if (found == nullptr) {
        refuse(place, name + " lacks \"" + std::string{key} + "\"");
    }
    return *found;
}

void TableReader::finish() const {
    for (const Entry& entry : table) {
        if (std::ranges::find(known, entry.key) == known.end()) {
            refuseUnknown(entry.setting.place, "key of " + name, entry.key, known);
        }
    }
}

}  // namespace raidinfo::settings
