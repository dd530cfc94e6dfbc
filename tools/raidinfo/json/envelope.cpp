#include "json/envelope.h"

#include <algorithm>
#include <nlohmann/json.hpp>
#include <utility>

#include "schema_version.h"
#include "system/timestamp.h"

namespace raidinfo {
namespace {

constexpr int indentation = 2;

// File names in messages may hold any bytes.
constexpr auto replaceInvalid = Json::error_handler_t::replace;

}  // namespace

std::string_view troubleCode(ExitStatus status) noexcept {
    return std::ranges::find(statusWords, status, &StatusWords::status)->code;
}

Json enveloped(const Source& source, const std::vector<Trouble>& troubles, Json data) {
    auto errors = Json::array();
    for (const auto& [code, message] : troubles) {
        errors.push_back(Json::object({{"code", std::string{code}}, {"message", message}}));
    }
    return Json::object(
        {{"schema_version", schemaVersion},
         {"generated_at", presentTimestamp()},
         {"source", Json::object({{"type", std::string{source.type}}, {"name", source.name}})},
         {"complete", troubles.empty()},
         {"errors", std::move(errors)},
         {"data", std::move(data)}});
}

std::string document(const Json& json) {
    return json.dump(indentation, ' ', false, replaceInvalid) + "\n";
}

std::string documentLine(const Json& json) {
    return json.dump(-1, ' ', false, replaceInvalid) + "\n";
}

}  // namespace raidinfo
