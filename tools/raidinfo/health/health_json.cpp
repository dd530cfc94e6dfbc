#include "health/health_json.h"

#include "inventory/value_json.h"

namespace raidinfo::health {
namespace {

using OrderedJson = nlohmann::ordered_json;

OrderedJson orNull(const auto& optional) {
    return optional ? OrderedJson(*optional) : OrderedJson(nullptr);
}

OrderedJson jsonOf(const Fact& fact) {
    return {
        {"field", fact.field}, {"value", toJson(fact.value)}, {"code_name", orNull(fact.codeName)}};
}

OrderedJson jsonOf(const Finding& finding);
OrderedJson jsonOf(const Checked& rule);

template <typename Element>
OrderedJson listOf(const std::vector<Element>& elements) {
    auto list = OrderedJson::array();
    for (const Element& element : elements) {
        list.push_back(jsonOf(element));
    }
    return list;
}

/// The first of the rule's conditions names what it is about; the others narrow it.
OrderedJson jsonOf(const Finding& finding) {
    auto object = OrderedJson::object({{"severity", word(finding.severity)},
                                       {"rule", finding.rule},
                                       {"message", finding.message},
                                       {"record",
                                        {{"kind", finding.record.kind},
                                         {"position", orNull(finding.record.position)},
                                         {"address", finding.record.address}}}});
    object.update(jsonOf(finding.facts.front()));
    object["facts"] = listOf(finding.facts);
    return object;
}

OrderedJson jsonOf(const Checked& rule) {
    return {{"rule", rule.rule},           {"severity", word(rule.severity)},
            {"enabled", rule.enabled},     {"kinds", rule.kinds},
            {"condition", rule.condition}, {"records", rule.records},
            {"findings", rule.findings},   {"place", rule.place}};
}

}  // namespace

OrderedJson healthData(const Verdict& verdict) {
    auto machine = OrderedJson::object();
    for (const Population& population : verdict.machine) {
        machine[population.kind] = population.records;
    }
    return {{"verdict", word(verdict.severity)},
            {"status", exitStatus(verdict)},
            {"reason", verdict.reason.empty() ? OrderedJson(nullptr) : OrderedJson(verdict.reason)},
            {"findings", listOf(verdict.findings)},
            {"checked", listOf(verdict.checked)},
            {"records", machine}};
}

}  // namespace raidinfo::health
