#include "diff/details.h"

#include <algorithm>
#include <array>
#include <iterator>

#include "diff/rules.h"
#include "diff/values.h"
#include "text/printable.h"

namespace raidinfo::diff {
namespace {

Json valueOrNull(const Json* value) { return value == nullptr ? Json(nullptr) : *value; }

std::string titleOf(const Subject& subject, const std::string& key) {
    if (const Field* const field = fieldOf(subject, key)) {
        return std::string{field->title};
    }
    std::string title = printable(key);
    std::ranges::replace(title, '_', ' ');
    if (!title.empty() && title[0] >= 'a' && title[0] <= 'z') {
        title[0] = static_cast<char>(title[0] - 'a' + 'A');
    }
    return title;
}

bool isDisplayName(const Subject& subject, std::string_view key) {
    const Field* const field = fieldOf(subject, key);
    return field != nullptr && field->shape == Shape::displayName;
}

bool hasMeaning(const Subject& subject, const std::string& key) {
    return key != "position" && !isList(subject, key) && !isDisplayName(subject, key);
}

/// The fields that mean something, in the order in which they are told; with those that only
/// another record has.
std::vector<std::string> fieldKeys(const Entry& entry, const Entry* other = nullptr) {
    const Subject& subject = *entry.subject;
    std::vector<std::string> keys;
    const auto add = [&](const Entry& from, const auto& isWanted) {
        for (const auto& [key, value] : from.record->items()) {
            if (isWanted(key) && hasMeaning(subject, key)) {
                keys.push_back(key);
            }
        }
    };
    add(entry, [](const std::string& /*key*/) { return true; });
    if (other != nullptr) {
        add(*other, [&entry](const std::string& key) { return entry.field(key) == nullptr; });
    }
    std::ranges::stable_sort(
        keys, {}, [&subject](const std::string& key) { return rankOf(ruleOf(subject, key)); });
    return keys;
}

/// Whether the field only repeats a number of the record's place.
bool repeatsPlace(const Entry& entry, const std::string& key, const Json* value) {
    const Json* const number =
        key == entry.subject->number ? &entry.number() : entry.placeNumber(key);
    return number != nullptr && value != nullptr && *value == *number;
}

/// Whether the field only repeats which array lists the record.
bool repeatsHolder(const Entry& entry, const Json* value) {
    return value != nullptr && (*value == 0 || entry.holders.contains("array " + value->dump()));
}

bool isToldOtherwise(const std::string& key, const Entry& before, const Entry& after) {
    const Json* const from = before.field(key);
    const Json* const to = after.field(key);
    if (repeatsPlace(before, key, from) && repeatsPlace(after, key, to)) {
        return true;
    }
    return ruleOf(*after.subject, key).followsHolder && before.holders != after.holders &&
           repeatsHolder(before, from) && repeatsHolder(after, to);
}

std::string withLead(std::string_view lead, const std::string& text) {
    return lead.empty() ? text : std::string{lead} + " " + text;
}

Detail difference(const std::string& key, const Entry& before, const Entry& after,
                  const CodeBook& book) {
    const Subject& subject = *after.subject;
    const Rule& rule = ruleOf(subject, key);
    const Json* const from = before.field(key);
    const Json* const to = after.field(key);
    Detail detail{.key = key,
                  .title = titleOf(subject, key),
                  .before = valueOrNull(from),
                  .after = valueOrNull(to),
                  .direction = direction(rule, wordFor(subject, key, from, book),
                                         wordFor(subject, key, to, book)),
                  .text = {}};
    if (!rule.begins.empty() && detail.before.is_boolean() && detail.after.is_boolean()) {
        detail.text = detail.after == true ? rule.begins : rule.ends;
    } else {
        detail.text =
            withLead(rule.lead ? *rule.lead : inSentence(detail.title),
                     shown(subject, key, from, book) + " → " + shown(subject, key, to, book));
    }
    return detail;
}

bool areEqual(const Json* left, const Json* right) {
    return left == nullptr || right == nullptr ? left == right : *left == *right;
}

/// What an entry has a set of, and how it is told that something came into it or went.
struct SetWords {
    std::set<std::string> Entry::*items;
    std::string_view key;
    std::string_view title;
    std::string_view comes;
    std::string_view goes;
    std::string_view is;
    Direction directionOfComing;
};

constexpr std::array sets{
    SetWords{&Entry::holders, "member_of", "Member of", "joined", "left", "in", Direction::neutral},
    SetWords{&Entry::missing, "missing_member", "Missing member", "misses", "no longer misses",
             "misses", Direction::worse},
};

Direction opposite(Direction direction) {
    return direction == Direction::worse ? Direction::better : direction;
}

Detail gone(const SetWords& words, const std::string& item, std::string_view lead,
            Direction direction = Direction::neutral) {
    return {.key = std::string{words.key},
            .title = std::string{words.title},
            .before = item,
            .after = nullptr,
            .direction = direction,
            .text = withLead(lead, item)};
}

Detail come(const SetWords& words, const std::string& item, std::string_view lead,
            Direction direction = Direction::neutral) {
    Detail detail = gone(words, item, lead, direction);
    std::swap(detail.before, detail.after);
    return detail;
}

void addSetDifferences(const Entry& before, const Entry& after, std::vector<Detail>& details) {
    for (const SetWords& words : sets) {
        const auto& from = before.*words.items;
        const auto& to = after.*words.items;
        for (const std::string& item : from) {
            if (!to.contains(item)) {
                details.push_back(gone(words, item, words.goes, opposite(words.directionOfComing)));
            }
        }
        for (const std::string& item : to) {
            if (!from.contains(item)) {
                details.push_back(come(words, item, words.comes, words.directionOfComing));
            }
        }
    }
}

/// What the tree shows of a field: nothing of an empty text or a flag that is not set.
std::string fieldDescription(const Subject& subject, const std::string& key, const Json& value,
                             const CodeBook& book) {
    const Field* const field = fieldOf(subject, key);
    const bool isShown = field == nullptr ? !value.is_null() : field->summary == Summary::yes;
    const bool isEmpty = value.is_string() && value.get_ref<const std::string&>().empty();
    if (!isShown || isEmpty || value == false) {
        return {};
    }
    std::string title = inSentence(titleOf(subject, key));
    if (value == true) {
        return title;
    }
    const bool speaksForItself = ruleOf(subject, key).lead == "" && value.is_string();
    return withLead(speaksForItself ? "" : title, shown(subject, key, &value, book));
}

std::vector<Detail> presentFields(const Entry& entry, const CodeBook& book) {
    std::vector<Detail> details;
    for (const std::string& key : fieldKeys(entry)) {
        const Json& value = *entry.field(key);
        if (repeatsPlace(entry, key, &value)) {
            continue;
        }
        if (std::string text = fieldDescription(*entry.subject, key, value, book); !text.empty()) {
            details.push_back({.key = key,
                               .title = titleOf(*entry.subject, key),
                               .before = nullptr,
                               .after = value,
                               .text = std::move(text)});
        }
    }
    return details;
}

/// The parts that came or went with the record, counted.
void addParts(const Entry& entry, std::vector<Detail>& details) {
    for (const SubjectId id : entry.subject->lists) {
        const Subject& part = subjectOf(id);
        const Json* const list = part.traits.isPart ? entry.field(listKey(part)) : nullptr;
        if (list == nullptr || list->empty()) {
            continue;
        }
        const Kind& kind = kindOf(part.kinds.front());
        details.push_back(
            {.key = std::string{kind.key},
             .title = std::string{kind.plural},
             .before = nullptr,
             .after = list->size(),
             .text = std::to_string(list->size()) + " " +
                     (list->size() == 1 ? std::string{part.noun} : inSentence(kind.plural))});
    }
}

}  // namespace

std::vector<Detail> differences(const Entry& before, const Entry& after, const CodeBook& book) {
    std::vector<Detail> details;
    for (const std::string& key : fieldKeys(after, &before)) {
        if (!areEqual(before.field(key), after.field(key)) &&
            !isToldOtherwise(key, before, after)) {
            details.push_back(difference(key, before, after, book));
        }
    }
    addSetDifferences(before, after, details);
    return details;
}

std::vector<Detail> description(const Entry& entry, Type type, const CodeBook& book) {
    std::vector<Detail> details = presentFields(entry, book);
    for (const SetWords& words : sets) {
        for (const std::string& item : entry.*words.items) {
            details.push_back(come(words, item, words.is));
        }
    }
    addParts(entry, details);
    if (type == Type::removed) {
        for (Detail& detail : details) {
            std::swap(detail.before, detail.after);
        }
    }
    return details;
}

}  // namespace raidinfo::diff
