#include "settings/setting.h"

#include <utility>

#include "exit_status.h"
#include "text/decoded.h"
#include "text/enumerated.h"
#include "text/printable.h"

namespace raidinfo::settings {
namespace {

template <typename Type>
const Type& typed(const Setting& setting, const char* expected) {
    const auto* const value = std::get_if<Type>(&setting.value);
    if (value == nullptr) {
        refuse(setting.place, std::string{"expected "} + expected);
    }
    return *value;
}

}  // namespace

std::string shown(const Place& place) {
    // The name of a file may be any bytes, and JSON takes UTF-8 only.
    return printable(decoded(place.file)) + ":" + std::to_string(place.line);
}

void refuse(const Place& place, const std::string& problem) {
    throw Failure{ExitStatus::badInput, shown(place) + ": " + printable(problem)};
}

void refuseUnknown(const Place& place, const std::string& what, const std::string& word,
                   const std::vector<std::string>& known) {
    refuse(place, "unknown " + what + " \"" + word + "\"; known: " + enumerated(known));
}

bool flagOf(const Setting& setting) { return typed<bool>(setting, "true or false"); }

int numberOf(const Setting& setting) {
    const auto value = typed<std::int64_t>(setting, "a whole number");
    if (!std::in_range<int>(value)) {
        refuse(setting.place, "the number is out of range");
    }
    return static_cast<int>(value);
}

const std::string& textOf(const Setting& setting) {
    return typed<std::string>(setting, "a text in quotes");
}

const Table& tableOf(const Setting& setting) { return typed<Table>(setting, "a table"); }

const List& listOf(const Setting& setting) { return typed<List>(setting, "a list"); }

}  // namespace raidinfo::settings
