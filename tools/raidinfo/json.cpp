#include "json.h"

#include <nlohmann/json.hpp>

#include "overloaded.h"

namespace raidinfo {
namespace {

using Json = nlohmann::ordered_json;

constexpr int indentation = 2;

Json toJson(const Value& value) {
    return std::visit(Overloaded{[](UnknownStatus) { return Json(nullptr); },
                                 [](const auto& known) { return Json(known); }},
                      value);
}

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

std::string document(const Json& json) { return json.dump(indentation) + "\n"; }

}  // namespace

std::string inventoryJson(const Snapshot& snapshot) {
    auto lists = Json::object();
    for (const Kind& kind : inventoryKinds()) {
        auto list = Json::array();
        for (const Record& record : snapshot.of(kind.id)) {
            auto object = Json::object({{"position", list.size()}});
            addFields(object, kind, record);
            list.push_back(std::move(object));
        }
        lists[std::string{kind.key}] = std::move(list);
    }
    return document(lists);
}

std::string treeJson(const Group& roots) {
    auto object = Json::object();
    object[std::string{roots.key}] = toJson(roots);
    return document(object);
}

std::string eventJson(const Record& event) {
    auto object = Json::object();
    addFields(object, eventKind(), event);
    return object.dump() + "\n";
}

}  // namespace raidinfo
