#pragma once

#include <string>
#include <vector>

#include "settings/setting.h"

namespace raidinfo::health {

/// A named table of a policy file, not yet understood.
struct Draft {
    std::string name;
    settings::Place place;
    settings::Table table;
    bool isChange = false;  ///< wholly or partly of a file that amends the default policy
};

/// A policy file, not yet understood.
struct Drafts {
    bool amends = true;  ///< the default policy
    std::vector<Draft> counts;
    std::vector<Draft> rules;
};

[[nodiscard]] Drafts readDrafts(const settings::Table& document);

/// Where a change has the name of a table, its keys take the place of those; other changes are new.
[[nodiscard]] Drafts amended(Drafts base, const Drafts& changes);

}  // namespace raidinfo::health
