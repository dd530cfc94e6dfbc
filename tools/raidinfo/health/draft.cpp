#include "health/draft.h"

#include <algorithm>
#include <string_view>

#include "settings/table_reader.h"

namespace raidinfo::health {
namespace {

constexpr std::string_view nameCharacters =
    "abcdefghijklmnopqrstuvwxyzABCDEFGHIJKLMNOPQRSTUVWXYZ0123456789-_";

Draft draftIn(const settings::Setting& setting, const std::string& what) {
    const settings::Table& table = tableOf(setting);
    const settings::Setting& name = settings::TableReader{table, setting.place, what}.need("name");
    const std::string& text = textOf(name);
    if (text.empty() || text.find_first_not_of(nameCharacters) != std::string::npos) {
        refuse(name.place, "a name consists of letters, digits, hyphens and underscores");
    }
    return {.name = text, .place = name.place, .table = table};
}

std::vector<Draft> draftsIn(const settings::Setting* list, const std::string& what) {
    std::vector<Draft> drafts;
    if (list == nullptr) {
        return drafts;
    }
    for (const settings::Setting& setting : listOf(*list)) {
        Draft draft = draftIn(setting, what);
        if (std::ranges::find(drafts, draft.name, &Draft::name) != drafts.end()) {
            refuse(draft.place, "the name \"" + draft.name + "\" stands there twice");
        }
        drafts.push_back(std::move(draft));
    }
    return drafts;
}

/// Tells of the setting as if it stood at this place.
void standAt(settings::Setting& setting, const settings::Place& at) {
    setting.place = at;
    if (auto* const list = std::get_if<settings::List>(&setting.value)) {
        for (settings::Setting& element : *list) {
            standAt(element, at);
        }
    } else if (auto* const table = std::get_if<settings::Table>(&setting.value)) {
        for (settings::Entry& entry : *table) {
            standAt(entry.setting, at);
        }
    }
}

/// What is wrong with the whole is for the author of the change to mend, so that everything stands
/// where the change does.
void amend(Draft& draft, const Draft& change) {
    draft.place = change.place;
    draft.isChange = true;
    for (settings::Entry& entry : draft.table) {
        standAt(entry.setting, draft.place);
    }
    for (const settings::Entry& entry : change.table) {
        const auto replaced = std::ranges::find(draft.table, entry.key, &settings::Entry::key);
        if (replaced == draft.table.end()) {
            draft.table.push_back(entry);
        } else {
            replaced->setting = entry.setting;
        }
    }
}

void amend(std::vector<Draft>& drafts, const std::vector<Draft>& changes) {
    for (const Draft& change : changes) {
        const auto changed = std::ranges::find(drafts, change.name, &Draft::name);
        if (changed == drafts.end()) {
            drafts.push_back(change);
            drafts.back().isChange = true;
        } else {
            amend(*changed, change);
        }
    }
}

}  // namespace

Drafts readDrafts(const settings::Table& document) {
    settings::TableReader reader{document, {}, "policy"};
    Drafts drafts;
    if (const settings::Setting* const defaults = reader.find("defaults")) {
        drafts.amends = flagOf(*defaults);
    }
    drafts.counts = draftsIn(reader.find("count"), "count");
    drafts.rules = draftsIn(reader.find("rule"), "rule");
    reader.finish();
    return drafts;
}

Drafts amended(Drafts base, const Drafts& changes) {
    amend(base.counts, changes.counts);
    amend(base.rules, changes.rules);
    return base;
}

}  // namespace raidinfo::health
