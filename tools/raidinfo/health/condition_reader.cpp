#include <algorithm>
#include <cstdint>
#include <iterator>
#include <set>
#include <string>
#include <utility>

#include "health/condition.h"
#include "health/contradiction.h"
#include "settings/table_reader.h"
#include "text/enumerated.h"

namespace raidinfo::health {
namespace {

using settings::Entry;
using settings::refuse;
using settings::refuseUnknown;
using settings::Setting;

struct OperatorWords {
    std::string_view key;
    std::string_view sentence;
};

// In the order of Operator.
constexpr auto operatorWords = std::to_array<OperatorWords>({
    {"is", "is"},
    {"not", "is not"},
    {"in", "is one of"},
    {"not_in", "is none of"},
    {"below", "is below"},
    {"above", "is above"},
    {"at_most", "is at most"},
    {"at_least", "is at least"},
    {"known", "is"},
});

template <typename Rows>
std::vector<std::string> keysOf(const Rows& rows) {
    std::vector<std::string> keys;
    std::ranges::transform(rows, std::back_inserter(keys),
                           [](const auto& row) { return std::string{row.key}; });
    return keys;
}

/// Reads what a field is compared with.
class Comparison {
public:
    Comparison(std::string_view kind, const RuleField& compared, const CodeBook& codeBook)
        : qualified{std::string{kind} + "." + std::string{compared.key}},
          field{compared},
          codes{codeBook.codes(kindOfCodes(kind), compared.key)},
          codesStandAt{codeBook.origin(kindOfCodes(kind), compared.key)} {
        result.field = compared.key;
    }

    Condition read(Operator comparison, const Setting& setting) {
        result.comparison = comparison;
        const auto& words = operatorWords[static_cast<std::size_t>(comparison)];
        result.text = result.field + " " + std::string{words.sentence} + " ";
        switch (comparison) {
            case Operator::is:
            case Operator::isNot:
                addOperand(setting);
                break;
            case Operator::in:
            case Operator::notIn:
                addOperands(setting);
                break;
            case Operator::below:
            case Operator::above:
            case Operator::atMost:
            case Operator::atLeast:
                addBound(setting);
                break;
            case Operator::known:
                addKnowledge(setting);
                break;
        }
        return std::move(result);
    }

private:
    void addOperands(const Setting& setting) {
        const settings::List& list = listOf(setting);
        if (list.empty()) {
            refuse(setting.place, "the list is empty");
        }
        for (const Setting& element : list) {
            result.text += &element == list.data() ? "" : ", ";
            addOperand(element);
        }
    }

    void addOperand(const Setting& setting) {
        switch (field.type) {
            case FieldType::number:
            case FieldType::count:
                return addNumber(setting);
            case FieldType::flag:
                return add(flagOf(setting), flagOf(setting) ? "true" : "false");
            case FieldType::text:
                return add(textOf(setting), textOf(setting));
            case FieldType::word:
                return addWord(setting);
            case FieldType::numbers:
                refuse(setting.place, qualified + " is a list and cannot be compared");
        }
    }

    void addNumber(const Setting& setting) {
        if (!std::holds_alternative<std::string>(setting.value)) {
            const int number = numberOf(setting);
            requireReachable(setting, number);
            return add(number, std::to_string(number));
        }
        const std::string& name = textOf(setting);
        if (codes == nullptr) {
            refuse(setting.place, qualified + " has no codes, so it is compared with a number");
        }
        result.byName = true;
        result.text += name;
        if (!named.insert(name).second) {
            return;  // Said twice in the same list.
        }
        const std::size_t before = result.operands.size();
        for (const auto& [code, meaning] : *codes) {
            if (meaning == name) {
                result.operands.emplace_back(code);
            }
        }
        // Without any codes all are unknown, and that is what the code book wants.
        if (!codes->empty() && result.operands.size() == before) {
            refuseName(setting.place, name);
        }
    }

    [[noreturn]] void refuseName(const settings::Place& place, const std::string& name) const {
        std::vector<std::string> names;
        for (const auto& row : *codes) {
            names.push_back(row.second);
        }
        refuse(place, "no code of " + qualified + " is called \"" + name + "\"; known: " +
                          enumerated(names) + " (" + std::string{codesStandAt} + ")");
    }

    void requireReachable(const Setting& setting, std::int64_t number) const {
        if (field.type == FieldType::count && number < 0) {
            refuse(setting.place, qualified + " is a count, and never below 0");
        }
    }

    void addWord(const Setting& setting) {
        const std::string& name = textOf(setting);
        if (std::ranges::find(field.words, name) == field.words.end()) {
            refuseUnknown(setting.place, "word of " + qualified, name,
                          {field.words.begin(), field.words.end()});
        }
        result.byName = true;
        add(name, name);
    }

    void addBound(const Setting& setting) {
        if (field.type != FieldType::number && field.type != FieldType::count) {
            refuse(setting.place, qualified + " is no number");
        }
        const int bound = numberOf(setting);
        requireReachable(setting,
                         result.comparison == Operator::below ? std::int64_t{bound} - 1 : bound);
        add(bound, std::to_string(bound));
    }

    void addKnowledge(const Setting& setting) {
        if (field.type != FieldType::word && codes == nullptr) {
            refuse(setting.place, qualified + " has no codes that could be unknown");
        }
        add(flagOf(setting), flagOf(setting) ? "known" : "not known");
    }

    template <typename T>
    void add(const T& operand, const std::string& text) {
        result.operands.emplace_back(operand);
        result.text += text;
    }

    std::string qualified;  ///< "disk_drives.state"
    const RuleField& field;
    const CodeBook::Codes* codes;
    std::string_view codesStandAt;
    std::set<std::string> named;  ///< of the operands so far
    Condition result;
};

}  // namespace

Condition readCondition(const Setting& setting, std::string_view kind,
                        const std::vector<RuleField>& fields, const CodeBook& book) {
    settings::TableReader reader{tableOf(setting), setting.place, "condition"};
    const Setting& name = reader.need("field");
    const auto field = std::ranges::find(fields, textOf(name), &RuleField::key);
    if (field == fields.end()) {
        refuseUnknown(name.place, "field of " + std::string{kind}, textOf(name), keysOf(fields));
    }
    const Entry* comparison = nullptr;
    for (const Entry& entry : tableOf(setting)) {
        if (entry.key == "field") {
            continue;
        }
        if (comparison != nullptr) {
            refuse(entry.setting.place, "a condition has one operator");
        }
        comparison = &entry;
    }
    if (comparison == nullptr) {
        refuse(setting.place,
               "the condition lacks an operator: " + enumerated(keysOf(operatorWords)));
    }
    const auto words = std::ranges::find(operatorWords, comparison->key, &OperatorWords::key);
    if (words == operatorWords.end()) {
        refuseUnknown(comparison->setting.place, "operator", comparison->key,
                      keysOf(operatorWords));
    }
    return Comparison{kind, *field, book}.read(static_cast<Operator>(words - operatorWords.begin()),
                                               comparison->setting);
}

std::vector<Condition> readConditions(const Setting& setting, std::string_view kind,
                                      const std::vector<RuleField>& fields, const CodeBook& book) {
    std::vector<Condition> conditions;
    if (std::holds_alternative<settings::Table>(setting.value)) {
        conditions.push_back(readCondition(setting, kind, fields, book));
    } else {
        for (const Setting& condition : listOf(setting)) {
            conditions.push_back(readCondition(condition, kind, fields, book));
        }
    }
    if (conditions.empty()) {
        refuse(setting.place, "the list of conditions is empty");
    }
    const std::string contradiction = contradictionIn(conditions, kind, fields, book);
    if (!contradiction.empty()) {
        refuse(setting.place, contradiction);
    }
    return conditions;
}

}  // namespace raidinfo::health
