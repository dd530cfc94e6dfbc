#include "inventory/value_json.h"

#include <nlohmann/json.hpp>

#include "overloaded.h"

namespace raidinfo {

nlohmann::ordered_json toJson(const Value& value) {
    using Json = nlohmann::ordered_json;
    return std::visit(Overloaded{[](Unknown) { return Json(nullptr); },
                                 [](const auto& known) { return Json(known); }},
                      value);
}

}  // namespace raidinfo
