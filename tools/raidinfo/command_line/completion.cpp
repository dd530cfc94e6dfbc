#include "completion/completion.h"

#include <set>
#include <string>
#include <utility>
#include <vector>

#include "command_line/description.h"
#include "command_line/options.h"

namespace raidinfo {
namespace {

using completion::Form;
using completion::Words;

Words columnKeys(const Kind& kind) {
    Words keys;
    for (const ListColumn& column : columnsOf(kind)) {
        keys.emplace_back(column.key);
    }
    return keys;
}

/// Kinds, columns of the kind that was given, and what a condition on such a column starts with.
std::vector<completion::Values> inventoryValues() {
    completion::Values kinds{value_type::kind, Form::word};
    completion::Values columns{value_type::columns, Form::list, {}, {"all"}};
    completion::Values conditions{value_type::filter, Form::start};
    std::set<std::string> ofAnyKind;
    for (const Kind& kind : inventoryKinds()) {
        const std::string key{kind.key};
        Words keys = columnKeys(kind);
        ofAnyKind.insert(keys.begin(), keys.end());
        kinds.words.push_back(key);
        conditions.wordsBehind.emplace_back(key, keys);
        columns.wordsBehind.emplace_back(key, std::move(keys));
    }
    conditions.words.assign(ofAnyKind.begin(), ofAnyKind.end());
    return {std::move(kinds), std::move(columns), std::move(conditions)};
}

}  // namespace

std::string bashCompletion() {
    const Description description;
    std::vector<completion::Values> values = inventoryValues();
    values.push_back({value_type::file, Form::file});
    values.push_back({value_type::when, Form::word, colorChoices()});
    return completion::forBash(description.app(), values);
}

}  // namespace raidinfo
