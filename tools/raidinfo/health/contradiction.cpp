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

/// The values that a field can have: each known code, word or flag, and what the others are.
struct Domain {
    enum class Others : std::uint8_t { none, unknown, numbers, texts };

    std::set<Value> known;
    Others others = Others::none;
    std::int64_t least = std::numeric_limits<int>::min();
    std::int64_t greatest = std::numeric_limits<int>::max();
};

Domain domainOf(const RuleField& field, const CodeBook::Codes* codes) {
    Domain domain;
    switch (field.type) {
        case FieldType::count:
            domain.least = 0;
            [[fallthrough]];
        case FieldType::number:
            domain.others = Domain::Others::numbers;
            if (codes != nullptr) {
                for (const auto& row : *codes) {
                    domain.known.emplace(row.first);
                }
            }
            break;
        case FieldType::flag:
            domain.known = {false, true};
            break;
        case FieldType::word:
            for (const std::string_view word : field.words) {
                domain.known.insert(Value{std::string{word}});
            }
            domain.others = Domain::Others::unknown;
            break;
        case FieldType::text:
        case FieldType::numbers:
            domain.others = Domain::Others::texts;
            break;
    }
    return domain;
}

/// The values of one field that fulfil the conditions so far. Each condition is looked at once, for
/// a file may speak of a field ten thousand times.
class Remainder {
public:
    explicit Remainder(Domain valuesOfField) : domain{std::move(valuesOfField)} {}

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
        return !(canBeKnown && hasKnown()) && !(canBeOther() && hasOther());
    }

private:
    static std::int64_t boundOf(const Condition& condition) {
        return std::get<int>(condition.operands.front());
    }

    void keepUpTo(std::int64_t bound) { domain.greatest = std::min(domain.greatest, bound); }
    void keepFrom(std::int64_t bound) { domain.least = std::max(domain.least, bound); }

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
        return number == nullptr || (domain.least <= *number && *number <= domain.greatest);
    }

    [[nodiscard]] bool fits(const Value& value) const {
        return isWithinBounds(value) && !excluded.contains(value) &&
               (!among || among->contains(value));
    }

    [[nodiscard]] bool hasKnown() const {
        return std::ranges::any_of(domain.known,
                                   [this](const Value& value) { return fits(value); });
    }

    /// Where nothing has a name now, anything may have one again.
    [[nodiscard]] bool canBeOther() const {
        return canBeUnknown || (canBeKnown && domain.known.empty());
    }

    [[nodiscard]] bool hasOther() const {
        if (among) {
            return std::ranges::any_of(*among, [this](const Value& value) {
                return !domain.known.contains(value) && fits(value);
            });
        }
        switch (domain.others) {
            case Domain::Others::none:
                return false;
            case Domain::Others::numbers:
                return hasOtherNumber();
            case Domain::Others::unknown:
            case Domain::Others::texts:
                break;
        }
        return true;
    }

    [[nodiscard]] bool hasOtherNumber() const {
        std::set<Value> taken = domain.known;
        taken.insert(excluded.begin(), excluded.end());
        const auto takenWithinBounds = std::ranges::count_if(
            taken, [this](const Value& value) { return isWithinBounds(value); });
        return takenWithinBounds < domain.greatest - domain.least + 1;
    }

    Domain domain;
    std::optional<std::set<Value>> among;
    std::set<Value> excluded;
    bool canBeKnown = true;
    bool canBeUnknown = true;
};

bool canHold(const std::vector<Condition>& conditions, const Domain& domain) {
    Remainder remainder{domain};
    for (const Condition& condition : conditions) {
        if (condition.byName && domain.known.empty()) {
            return true;
        }
        remainder.narrow(condition);
    }
    return !remainder.isEmpty();
}

}  // namespace

std::string contradictionIn(const std::vector<Condition>& conditions, std::string_view kind,
                            const std::vector<RuleField>& fields, const CodeBook& book) {
    std::set<std::string> judged;
    for (const Condition& condition : conditions) {
        if (!judged.insert(condition.field).second) {
            continue;
        }
        std::vector<Condition> ofField;
        std::ranges::copy_if(
            conditions, std::back_inserter(ofField),
            [&condition](const Condition& other) { return other.field == condition.field; });
        const auto* const codes = book.codes(kindOfCodes(kind), condition.field);
        const bool isAlone = ofField.size() == 1;
        if (isAlone && codes != nullptr) {
            continue;
        }
        const auto field = std::ranges::find(fields, condition.field, &RuleField::key);
        if (!canHold(ofField, domainOf(*field, codes))) {
            return (isAlone ? "no value fulfils the condition: "
                            : "the conditions exclude each other: ") +
                   inWords(ofField);
        }
    }
    return "";
}

}  // namespace raidinfo::health
