#include "health/contradiction.h"

#include <algorithm>
#include <cstdint>
#include <iterator>
#include <limits>
#include <optional>
#include <set>
#include <utility>

namespace raidinfo::health {
namespace {

/// The values of one field that fulfil the conditions so far. Each condition is looked at once, for
/// a file may speak of a field ten thousand times.
class Remainder {
public:
    void narrow(const Condition& condition) {
        switch (condition.comparison) {
            case Operator::is:
            case Operator::in:
                return keepOnly(condition.operands);
            case Operator::isNot:
            case Operator::notIn:
                excluded.insert(condition.operands.begin(), condition.operands.end());
                canBeUnknown = canBeUnknown && !condition.byName;
                return;
            case Operator::below:
                return keepUpTo(boundOf(condition) - 1);
            case Operator::above:
                return keepFrom(boundOf(condition) + 1);
            case Operator::atMost:
                return keepUpTo(boundOf(condition));
            case Operator::atLeast:
                return keepFrom(boundOf(condition));
            case Operator::known:
                break;
        }
        const bool isKnown = std::get<bool>(condition.operands.front());
        canBeKnown = canBeKnown && isKnown;
        canBeUnknown = canBeUnknown && !isKnown;
    }

    [[nodiscard]] bool isEmpty() const {
        if (!canBeKnown && !canBeUnknown) {
            return true;
        }
        if (among) {
            return std::ranges::none_of(*among, [this](const Value& value) {
                return isWithinBounds(value) && !excluded.contains(value);
            });
        }
        return std::ranges::count_if(excluded, [this](const Value& value) {
                   return isWithinBounds(value);
               }) >= valuesWithinBounds();
    }

private:
    static std::int64_t boundOf(const Condition& condition) {
        return std::get<int>(condition.operands.front());
    }

    void keepUpTo(std::int64_t bound) { greatest = std::min(greatest, bound); }
    void keepFrom(std::int64_t bound) { least = std::max(least, bound); }

    void keepOnly(const std::vector<Value>& operands) {
        std::set<Value> kept;
        std::ranges::copy_if(
            operands, std::inserter(kept, kept.end()),
            [this](const Value& operand) { return !among || among->contains(operand); });
        among = std::move(kept);
    }

    /// Only numbers are ever bounded.
    [[nodiscard]] bool isWithinBounds(const Value& value) const {
        const int* const number = std::get_if<int>(&value);
        return number == nullptr || (least <= *number && *number <= greatest);
    }

    /// Texts, which are without end, count like numbers without bounds.
    [[nodiscard]] std::int64_t valuesWithinBounds() const {
        const bool areFlags = !excluded.empty() && std::holds_alternative<bool>(*excluded.begin());
        return areFlags ? 2 : greatest - least + 1;
    }

    std::optional<std::set<Value>> among;
    std::set<Value> excluded;
    std::int64_t least = std::numeric_limits<int>::min();
    std::int64_t greatest = std::numeric_limits<int>::max();
    bool canBeKnown = true;
    bool canBeUnknown = true;
};

bool canHold(const std::vector<Condition>& conditions) {
    Remainder remainder;
    for (const Condition& condition : conditions) {
        if (condition.byName && condition.operands.empty()) {
            return true;
        }
        remainder.narrow(condition);
    }
    return !remainder.isEmpty();
}

}  // namespace

std::string contradictionIn(const std::vector<Condition>& conditions) {
    std::set<std::string> judged;
    for (const Condition& condition : conditions) {
        if (!judged.insert(condition.field).second) {
            continue;
        }
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
