#include "health/condition.h"

#include <algorithm>

namespace raidinfo::health {
namespace {

bool isAmong(const std::vector<Value>& operands, const Value& value) {
    return std::ranges::find(operands, value) != operands.end();
}

int numberIn(const Value& value) { return std::get<int>(value); }

}  // namespace

bool holds(const Condition& condition, const Value& value, bool isKnown) {
    const std::vector<Value>& operands = condition.operands;
    switch (condition.comparison) {
        case Operator::is:
        case Operator::in:
            return isAmong(operands, value);
        case Operator::isNot:
        case Operator::notIn:
            return !isAmong(operands, value) && (isKnown || !condition.byName);
        case Operator::below:
            return numberIn(value) < numberIn(operands.front());
        case Operator::above:
            return numberIn(value) > numberIn(operands.front());
        case Operator::atMost:
            return numberIn(value) <= numberIn(operands.front());
        case Operator::atLeast:
            return numberIn(value) >= numberIn(operands.front());
        case Operator::known:
            break;
    }
    return isKnown == std::get<bool>(operands.front());
}

std::string inWords(const std::vector<Condition>& conditions) {
    std::string text;
    for (const Condition& condition : conditions) {
        text += (text.empty() ? "" : " and ") + condition.text;
    }
    return text;
}

}  // namespace raidinfo::health
