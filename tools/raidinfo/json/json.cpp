#include "json/json.h"

#include <nlohmann/json.hpp>
#include <string>

namespace raidinfo {
namespace {

void addFields(Json& object, const Kind& kind, const Record& record) {
    for (std::size_t index = 0; index < kind.fields.size(); ++index) {
        object[std::string{kind.fields[index].key}] = toJson(record.at(index));
    }
}

Json toJson(const Group& group);

Json toJson(const Node& node) {
    auto object = Json::object();
    if (node.position) {
        object["position"] = *node.position;
    }
    for (const auto& [key, value] : node.extras) {
        object[std::string{key}] = toJson(value);
    }
    if (node.record != nullptr && node.inFull) {
        addFields(object, *node.kind, *node.record);
    }
    for (const Group& group : node.groups) {
        object[std::string{group.key}] = toJson(group);
    }
    return object;
}

Json toJson(const Group& group) {
    auto list = Json::array();
    for (const Node& node : group.nodes) {
        list.push_back(toJson(node));
    }
    return list;
}

}  // namespace

Json rowsJson(const Listing& listing) {
    auto list = Json::array();
    for (const std::vector<Value>& row : listing.rows) {
        auto object = Json::object();
        for (std::size_t index = 0; index < row.size(); ++index) {
            object[std::string{listing.columns[index].key}] = toJson(row[index]);
        }
        list.push_back(std::move(object));
    }
    return list;
}

Json treeJson(const Group& roots) {
    auto object = Json::object();
    object[std::string{roots.key}] = toJson(roots);
    return object;
}

Json eventJson(const Record& event) {
    auto object = Json::object();
    addFields(object, eventKind(), event);
    return object;
}

}  // namespace raidinfo
