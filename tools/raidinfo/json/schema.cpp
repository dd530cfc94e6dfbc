#include "json/schema.h"

#include <nlohmann/json.hpp>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "doctor/examined.h"
#include "health/severity.h"
#include "inventory/kinds.h"
#include "inventory/overall_status.h"
#include "inventory/tree.h"
#include "schema_version.h"

namespace raidinfo {
namespace {

Json type(const char* name) { return Json::object({{"type", name}}); }

Json reference(std::string_view name) {
    return Json::object({{"$ref", "#/$defs/" + std::string{name}}});
}

Json listOf(Json item) { return Json::object({{"type", "array"}, {"items", std::move(item)}}); }

Json nullable(Json of) { return Json::object({{"anyOf", {std::move(of), type("null")}}}); }

/// Members that must be there; with others as well where an object can have more.
Json object(const std::vector<std::pair<std::string, Json>>& members, bool closed = true) {
    auto properties = Json::object();
    auto required = Json::array();
    for (const auto& [name, member] : members) {
        properties[name] = member;
        required.push_back(name);
    }
    auto result = Json::object({{"type", "object"},
                                {"properties", std::move(properties)},
                                {"required", std::move(required)}});
    if (closed) {
        result["additionalProperties"] = false;
    }
    return result;
}

Json typeOf(Shape shape) {
    switch (shape) {
        case Shape::number:
        case Shape::constant:
            return type("integer");
        case Shape::flag:
            return type("boolean");
        case Shape::numbers:
            return listOf(type("integer"));
        case Shape::statusText: {
            Json words = overallStatusWords;
            words.push_back(nullptr);
            return Json::object({{"enum", std::move(words)}});
        }
        case Shape::text:
        case Shape::displayName:
            break;
    }
    return type("string");
}

/// A record as `list` and `show` print it. Columns can be chosen, so none is required.
Json rowSchema(const Kind& kind) {
    auto properties = Json::object({{"position", type("integer")}});
    for (const TreeField& field : kind.fromTree) {
        properties[std::string{field.key}] =
            Json::object({{"type", {"integer", "boolean", "string", "null"}}});
    }
    for (const Field& field : kind.fields) {
        properties[std::string{field.key}] = typeOf(field.shape);
    }
    return Json::object({{"type", "object"},
                         {"properties", std::move(properties)},
                         {"additionalProperties", false}});
}

Json eventSchema() {
    std::vector<std::pair<std::string, Json>> members;
    for (const Field& field : eventKind().fields) {
        members.emplace_back(field.key, typeOf(field.shape));
    }
    return object(members);
}

Json listsSchema() {
    auto properties = Json::object();
    for (const Kind& kind : inventoryKinds()) {
        properties[std::string{kind.key}] = listOf(reference(kind.key));
    }
    return Json::object({{"type", "object"},
                         {"properties", std::move(properties)},
                         {"additionalProperties", false}});
}

/// The lists below a node have the names of kinds; what stands in them are nodes again.
Json nodeSchema() {
    auto lists = Json::object();
    for (const Kind& kind : inventoryKinds()) {
        lists[std::string{kind.key}] = listOf(reference("node"));
    }
    lists[std::string{hotSparesKey}] = listOf(reference("node"));
    lists["position"] = type("integer");
    return Json::object({{"type", "object"}, {"properties", std::move(lists)}});
}

Json showSchema() { return object({{"kind", type("string")}, {"record", type("object")}}); }

Json findingSchema() {
    return object({{"check", type("string")},
                   {"outcome", Json::object({{"enum", outcomeWords}})},
                   {"finding", type("string")}});
}

Json oneOf(std::initializer_list<const char*> words) {
    auto list = Json::array();
    for (const char* const word : words) {
        list.push_back(word);
    }
    return Json::object({{"enum", std::move(list)}});
}

Json severitySchema() { return Json::object({{"enum", health::severityWords}}); }

std::vector<std::pair<std::string, Json>> factMembers() {
    return {{"field", type("string")},
            {"value", Json::object()},
            {"code_name", nullable(type("string"))}};
}

Json healthSchema() {
    std::vector<std::pair<std::string, Json>> finding{
        {"severity", severitySchema()},
        {"rule", type("string")},
        {"message", type("string")},
        {"record", object({{"kind", type("string")},
                           {"position", nullable(type("integer"))},
                           {"address", type("string")}})}};
    const auto fact = factMembers();
    finding.insert(finding.end(), fact.begin(), fact.end());
    finding.emplace_back("facts", listOf(object(fact)));
    const Json checked = object({{"rule", type("string")},
                                 {"severity", severitySchema()},
                                 {"enabled", type("boolean")},
                                 {"kinds", listOf(type("string"))},
                                 {"condition", type("string")},
                                 {"records", type("integer")},
                                 {"findings", type("integer")},
                                 {"place", type("string")}});
    return object({{"verdict", severitySchema()},
                   {"status", Json::object({{"enum", {0, 1, 2, 3}}})},
                   {"reason", nullable(type("string"))},
                   {"findings", listOf(object(finding))},
                   {"checked", listOf(checked)},
                   {"records", Json::object({{"type", "object"},
                                             {"additionalProperties", type("integer")}})}});
}

Json diffSchema() {
    const Json direction = oneOf({"neutral", "worse", "better"});
    const Json detail = object({{"key", type("string")},
                                {"title", type("string")},
                                {"before", Json::object()},
                                {"after", Json::object()},
                                {"direction", direction},
                                {"text", type("string")}});
    const Json change =
        object({{"change", oneOf({"changed", "moved", "replaced", "added", "removed"})},
                {"direction", direction},
                {"kind", type("string")},
                {"place", type("object")},
                {"text", type("string")},
                {"details", listOf(detail)}},
               false);
    return object({{"changes", listOf(change)}});
}

Json definitions() {
    auto definitions = Json::object();
    for (const Kind& kind : inventoryKinds()) {
        definitions[std::string{kind.key}] = rowSchema(kind);
    }
    definitions["node"] = nodeSchema();
    definitions["list"] = listsSchema();
    definitions["show"] = showSchema();
    definitions["tree"] = object({{std::string{adaptersKey}, listOf(reference("node"))}});
    definitions["event"] = eventSchema();
    definitions["snapshot"] = object({{"file", type("string")}});
    definitions["record"] = object({{"file", type("string")}, {"answers", type("integer")}});
    definitions["health"] = healthSchema();
    definitions["diff"] = diffSchema();
    definitions["doctor"] = object({{"findings", listOf(findingSchema())}});
    return definitions;
}

Json anyData() {
    auto any = Json::array({type("null")});
    for (const char* const data :
         {"list", "show", "tree", "event", "snapshot", "record", "doctor", "health", "diff"}) {
        any.push_back(reference(data));
    }
    return Json::object({{"anyOf", std::move(any)}});
}

}  // namespace

Json schema() {
    const Json trouble = object({{"code", type("string")}, {"message", type("string")}});
    const Json source =
        object({{"type", Json::object({{"enum", {"service", "recording", "files", "none"}}})},
                {"name", type("string")}});
    Json document =
        object({{"schema_version", Json::object({{"const", schemaVersion}})},
                {"generated_at", Json::object({{"type", "string"}, {"format", "date-time"}})},
                {"source", source},
                {"complete", type("boolean")},
                {"errors", listOf(trouble)},
                {"data", anyData()}});
    auto result = Json::object({{"$schema", "https://json-schema.org/draft/2020-12/schema"},
                                {"title", "What raidinfo --json prints"}});
    result.update(document);
    result["$defs"] = definitions();
    return result;
}

}  // namespace raidinfo
