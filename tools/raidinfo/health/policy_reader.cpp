#include <algorithm>
#include <array>
#include <utility>

#include "health/containment.h"
#include "health/draft.h"
#include "health/policy.h"
#include "health/vocabulary.h"
#include "settings/document.h"
#include "settings/shipped.h"
#include "settings/table_reader.h"

namespace raidinfo::health {
namespace {

using settings::refuseUnknown;
using settings::Setting;

constexpr auto withinWords = std::to_array<std::string_view>({"adapter", "array"});

/// Where a word stands among the words that may stand there.
template <typename Words>
std::size_t placeAmong(const Words& words, const Setting& setting, const char* what) {
    const auto found = std::ranges::find(words, textOf(setting));
    if (found == words.end()) {
        refuseUnknown(setting.place, what, textOf(setting), {words.begin(), words.end()});
    }
    return static_cast<std::size_t>(found - words.begin());
}

std::string kindIn(const Setting& setting) {
    const auto kinds = ruleKinds();
    return kinds[placeAmong(kinds, setting, "kind")];
}

/// One kind or a list of them.
std::vector<std::string> kindsIn(const Setting& setting) {
    if (!std::holds_alternative<settings::List>(setting.value)) {
        return {kindIn(setting)};
    }
    std::vector<std::string> kinds;
    for (const Setting& kind : listOf(setting)) {
        if (std::ranges::find(kinds, kindIn(kind)) != kinds.end()) {
            refuse(kind.place, "the kind stands there twice");
        }
        kinds.push_back(kindIn(kind));
    }
    if (kinds.empty()) {
        refuse(setting.place, "the list of kinds is empty");
    }
    return kinds;
}

Severity severityIn(const Setting& setting) {
    // A rule that finds nothing wrong would be none.
    const auto words = std::span{severityWords}.subspan(1);
    return static_cast<Severity>(placeAmong(words, setting, "severity") + 1);
}

Count readCount(const Draft& draft, const CodeBook& book) {
    settings::TableReader reader{draft.table, draft.place, "count \"" + draft.name + "\""};
    Count count{.name = textOf(reader.need("name")),
                .place = draft.place,
                .isChange = draft.isChange,
                .on = kindsIn(reader.need("on")),
                .of = kindIn(reader.need("of")),
                .within = static_cast<Count::Within>(
                    placeAmong(withinWords, reader.need("within"), "place")),
                .when = {}};
    count.when = readConditions(reader.need("when"), count.of, ruleFields(count.of), book);
    reader.finish();
    for (const std::string& kind : count.on) {
        if (!canBeWithin(count.of, count.within, kind)) {
            refuse(reader.need("of").place,
                   "there are no " + count.of + " within the " +
                       std::string{withinWords[static_cast<std::size_t>(count.within)]} + " of " +
                       kind);
        }
        const auto fields = ruleFields(kind);
        if (std::ranges::find(fields, count.name, &RuleField::key) != fields.end()) {
            refuse(draft.place, "the kind " + kind + " has a field of this name");
        }
    }
    return count;
}

/// The fields of a kind and what is counted for it.
std::vector<RuleField> fieldsWithCounts(const std::string& kind, const std::vector<Count>& counts) {
    auto fields = ruleFields(kind);
    for (const Count& count : counts) {
        if (std::ranges::find(count.on, kind) != count.on.end()) {
            fields.push_back({count.name, FieldType::count});
        }
    }
    return fields;
}

void checkPlaceholders(const Message& message, const Setting& setting, const std::string& kind,
                       const std::vector<RuleField>& fields) {
    for (const std::string& name : message.fields()) {
        if (std::ranges::find(fields, name, &RuleField::key) == fields.end()) {
            std::vector<std::string> known;
            for (const RuleField& field : fields) {
                known.emplace_back(field.key);
            }
            refuseUnknown(setting.place, "field of " + kind, name, known);
        }
    }
}

bool speaksOf(const Setting& condition, const std::string& field) {
    const Setting* const named =
        settings::TableReader{tableOf(condition), condition.place, "condition"}.find("field");
    return named != nullptr && textOf(*named) == field;
}

bool speakOf(const Setting& when, const std::string& field) {
    return std::holds_alternative<settings::List>(when.value)
               ? std::ranges::any_of(
                     listOf(when),
                     [&field](const Setting& condition) { return speaksOf(condition, field); })
               : speaksOf(when, field);
}

/// Where a default rule lacks a count because that was changed, the change is wrong, not the rule.
void refuseLoss(const Draft& rule, const Setting& when, const std::string& kind,
                const std::vector<Count>& counts) {
    for (const Count& count : counts) {
        const bool isLost =
            count.isChange && !rule.isChange && std::ranges::find(count.on, kind) == count.on.end();
        if (isLost && speakOf(when, count.name)) {
            refuse(count.place, "rule \"" + rule.name + "\" needs the count on " + kind + " (" +
                                    settings::shown(rule.place) + ")");
        }
    }
}

Rule readRule(const Draft& draft, const std::vector<Count>& counts, const CodeBook& book) {
    settings::TableReader reader{draft.table, draft.place, "rule \"" + draft.name + "\""};
    const Setting& message = reader.need("message");
    Rule rule{.name = textOf(reader.need("name")),
              .place = draft.place,
              .severity = severityIn(reader.need("severity")),
              .message = Message{message},
              .scopes = {}};
    const Setting* const enabled = reader.find("enabled");
    const Setting* const fallback = reader.find("fallback");
    const Setting& kinds = reader.need("kind");
    const Setting& when = reader.need("when");
    reader.finish();
    rule.enabled = enabled == nullptr || flagOf(*enabled);
    rule.fallback = fallback != nullptr && flagOf(*fallback);
    if (!rule.enabled) {
        return rule;  // it may speak of what this code book does not have
    }
    for (std::string& kind : kindsIn(kinds)) {
        refuseLoss(draft, when, kind, counts);
        const auto fields = fieldsWithCounts(kind, counts);
        checkPlaceholders(rule.message, message, kind, fields);
        auto conditions = readConditions(when, kind, fields, book);
        rule.scopes.push_back({std::move(kind), std::move(conditions)});
    }
    return rule;
}

Policy understood(const Drafts& drafts, const CodeBook& book) {
    Policy policy;
    for (const Draft& draft : drafts.counts) {
        policy.counts.push_back(readCount(draft, book));
    }
    for (const Draft& draft : drafts.rules) {
        policy.rules.push_back(readRule(draft, policy.counts, book));
    }
    return policy;
}

Drafts shippedDrafts() {
    return readDrafts(
        settings::shippedDocument(settings::shippedPolicy, settings::shippedFolder()));
}

}  // namespace

std::string inWords(const Rule& rule) {
    return rule.scopes.empty() ? ""
                               : inWords(rule.scopes.front().when) +
                                     (rule.fallback ? ", unless another rule explains it" : "");
}

Policy defaultPolicy(const CodeBook& book) { return understood(shippedDrafts(), book); }

Policy amendedPolicy(const settings::Table& document, const CodeBook& book) {
    const Drafts changes = readDrafts(document);
    return understood(changes.amends ? amended(shippedDrafts(), changes) : changes, book);
}

Policy readPolicy(const std::filesystem::path& path, const CodeBook& book) {
    return amendedPolicy(settings::readDocument(path), book);
}

}  // namespace raidinfo::health
