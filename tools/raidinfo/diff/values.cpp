#include "diff/values.h"

#include <algorithm>
#include <cstdint>
#include <utility>
#include <vector>

#include "inventory/records.h"
#include "inventory/value.h"
#include "text/printable.h"

namespace raidinfo::diff {
namespace {

/// A file may hold numbers that the service cannot send.
bool isNumberOfTheService(const Json& json) {
    return json.is_number_unsigned()  ? std::in_range<int>(json.get<std::uint64_t>())
           : json.is_number_integer() ? std::in_range<int>(json.get<std::int64_t>())
                                      : false;
}

/// None for what no record of the library can hold.
std::optional<Value> fromJson(const Json& json) {
    if (json.is_null()) {
        return Unknown{};
    }
    if (json.is_boolean()) {
        return json.get<bool>();
    }
    if (json.is_string()) {
        return json.get<std::string>();
    }
    if (isNumberOfTheService(json)) {
        return json.get<int>();
    }
    if (json.is_array() && std::ranges::all_of(json, isNumberOfTheService)) {
        return json.get<std::vector<int>>();
    }
    return std::nullopt;
}

}  // namespace

std::string shown(const Subject& subject, std::string_view key, const Json* value,
                  const CodeBook& book) {
    if (value == nullptr) {
        return "none";
    }
    const auto known = fromJson(*value);
    return known ? book.shown(listKey(subject), key, *known) : printable(value->dump());
}

std::optional<std::string> wordFor(const Subject& subject, std::string_view key, const Json* value,
                                   const CodeBook& book) {
    const auto known = value == nullptr ? std::nullopt : fromJson(*value);
    if (!known) {
        return std::nullopt;
    }
    if (const int* const code = std::get_if<int>(&*known)) {
        const auto name = book.name(listKey(subject), key, *code);
        return name ? std::optional{std::string{*name}} : std::nullopt;
    }
    return raidinfo::shown(*known);
}

}  // namespace raidinfo::diff
