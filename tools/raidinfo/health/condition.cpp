#include "health/condition.h"

#include <algorithm>

namespace raidinfo::health {
namespace {

bool isAmong(const std::vector<Value>& operands, const Value& value) {
    return std::ranges::find(operands, value) != operands.end();
}

/// Of the number to the operand; a value that nobody knows has none.
bool compares(const Value& value, const Condition& condition, bool (*compare)(int, int)) {
    const int* const number = std::get_if<int>(&value);
    return number != nullptr && compare(*number, std::get<int>(condition.operands.front()));
}

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
            return compares(value, condition, [](int a, int b) { return a < b; });
        case Operator::above:
            return compares(value, condition, [](int a, int b) { return a > b; });
        case Operator::atMost:
            return compares(value, condition, [](int a, int b) { return a <= b; });
        case Operator::atLeast:
            return compares(value, condition, [](int a, int b) { return a >= b; });
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
