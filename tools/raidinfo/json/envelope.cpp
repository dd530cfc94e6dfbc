#include "json/envelope.h"

#include <algorithm>
#include <array>
#include <nlohmann/json.hpp>
#include <utility>

#include "system/timestamp.h"

namespace raidinfo {
namespace {

/// A member that is renamed or removed, or changes its meaning, makes it a new number.
constexpr auto schemaVersion = "1.0";

constexpr int indentation = 2;

constexpr auto codes = std::to_array<std::pair<ExitStatus, std::string_view>>({
    {ExitStatus::usage, "usage"},
    {ExitStatus::badInput, "bad_input"},
    {ExitStatus::noInput, "no_input"},
    {ExitStatus::serviceUnavailable, "service_unavailable"},
    {ExitStatus::internalError, "internal_error"},
    {ExitStatus::unusableLibrary, "unusable_library"},
    {ExitStatus::cannotCreate, "cannot_create"},
    {ExitStatus::outputFailed, "output_failed"},
    {ExitStatus::malformedAnswer, "malformed_answer"},
});

// File names in messages may hold any bytes.
constexpr auto replaceInvalid = Json::error_handler_t::replace;

}  // namespace

std::string_view troubleCode(ExitStatus status) noexcept {
    const auto found =
        std::ranges::find(codes, status, &std::pair<ExitStatus, std::string_view>::first);
    return found == codes.end() ? "internal_error" : found->second;
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
