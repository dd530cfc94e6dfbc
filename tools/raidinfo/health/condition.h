#pragma once

#include <array>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "codebook/code_book.h"
#include "health/vocabulary.h"
#include "inventory/records.h"
#include "settings/setting.h"

namespace raidinfo::health {

enum class Operator : std::uint8_t {
    is,
    isNot,
    in,
    notIn,
    below,
    above,
    atMost,
    atLeast,
    known,
};

/// A condition on one field, names resolved to the codes that bear them.
struct Condition {
    std::string field;
    Operator comparison = Operator::is;
    std::vector<Value> operands;
    bool byName = false;  ///< speaks of names, so that a code without one fulfils it in no way
    std::string text;     ///< "state is failed"
};

/// Whether a value that the record has fulfils the condition. A value is unknown when it is a code
/// without a name or a status without a word.
[[nodiscard]] bool holds(const Condition& condition, const Value& value, bool isKnown);

/// Reads { field = "state", is = "failed" } on a kind of record with these fields.
[[nodiscard]] Condition readCondition(const settings::Setting& setting, std::string_view kind,
                                      const std::vector<RuleField>& fields, const CodeBook& book);

/// Reads one condition or a list of them, all of which must hold.
[[nodiscard]] std::vector<Condition> readConditions(const settings::Setting& setting,
                                                    std::string_view kind,
                                                    const std::vector<RuleField>& fields,
                                                    const CodeBook& book);

/// "state is degraded and ready_spares is 0"
[[nodiscard]] std::string inWords(const std::vector<Condition>& conditions);

}  // namespace raidinfo::health
