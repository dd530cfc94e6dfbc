#include "health/contradiction.h"

#include <algorithm>
#include <cstdint>
#include <iterator>
#include <utility>

#include "overloaded.h"

namespace raidinfo::health {
namespace {

/// The operand and its neighbours, since whatever bounds it sets lie between these.
std::vector<Value> around(const Value& operand) {
    std::vector<Value> values{operand};
    std::visit(Overloaded{[&values](int number) {
                              for (const std::int64_t step : {-1, 1}) {
                                  const std::int64_t next = number + step;
                                  if (std::in_range<int>(next)) {
                                      values.emplace_back(static_cast<int>(next));
                                  }
                              }
                          },
                          [&values](bool flag) { values.emplace_back(!flag); }, [](const auto&) {}},
               operand);
    return values;
}

/// If any value fulfils the conditions on a field, one of these does.
std::vector<Value> tellingValues(const std::vector<Condition>& conditions) {
    std::vector<Value> values;
    std::string other = "other than ";
    bool isText = true;
    for (const Condition& condition : conditions) {
        if (condition.comparison == Operator::known) {
            continue;
        }
        for (const Value& operand : condition.operands) {
            std::ranges::move(around(operand), std::back_inserter(values));
            const auto* const text = std::get_if<std::string>(&operand);
            isText = text != nullptr;
            other += isText ? *text : "";
        }
    }
    if (isText) {
        values.emplace_back(std::move(other));
    }
    return values;
}

bool canHold(const std::vector<Condition>& conditions) {
    const bool lacksCodes = std::ranges::any_of(conditions, [](const Condition& condition) {
        return condition.byName && condition.operands.empty();
    });
    const auto fulfils = [&conditions](const Value& value, bool isKnown) {
        return std::ranges::all_of(conditions, [&](const Condition& condition) {
            return holds(condition, value, isKnown);
        });
    };
    return lacksCodes ||
           std::ranges::any_of(tellingValues(conditions), [&fulfils](const Value& value) {
               return fulfils(value, true) || fulfils(value, false);
           });
}

}  // namespace

std::string contradictionIn(const std::vector<Condition>& conditions) {
    for (const Condition& condition : conditions) {
        std::vector<Condition> ofField;
        std::ranges::copy_if(
            conditions, std::back_inserter(ofField),
            [&condition](const Condition& other) { return other.field == condition.field; });
        if (ofField.size() > 1 && !canHold(ofField)) {
            return inWords(ofField);
        }
    }
    return "";
}

}  // namespace raidinfo::health
