#pragma once

#include <cstdint>
#include <filesystem>
#include <string>
#include <vector>

#include "codebook/code_book.h"
#include "health/condition.h"
#include "health/message.h"
#include "health/severity.h"
#include "settings/setting.h"

namespace raidinfo::health {

/// A number of other records, which rules speak of like a field: the hot spares of an adapter, say.
struct Count {
    enum class Within : std::uint8_t { adapter, array };

    std::string name;
    settings::Place place = {};
    bool isChange = false;        ///< wholly or partly of a file that amends the default policy
    std::vector<std::string> on;  ///< the kinds that have it
    std::string of;               ///< the kind that is counted
    Within within = Within::adapter;
    std::vector<Condition> when;
};

/// What a rule looks at of one kind; the codes behind a name may differ from kind to kind.
struct Scope {
    std::string kind;
    std::vector<Condition> when;
};

struct Rule {
    std::string name;
    settings::Place place;
    bool enabled = true;
    bool fallback = false;  ///< only speaks of what no other rule explains
    Severity severity = Severity::critical;
    Message message;
    std::vector<Scope> scopes;
};

/// "state is failed"
[[nodiscard]] std::string inWords(const Rule& rule);

struct Policy {
    std::vector<Count> counts;
    std::vector<Rule> rules;
};

/// The policy that comes with the program. It names codes, so it depends on the code book.
[[nodiscard]] Policy defaultPolicy(const CodeBook& book);

/// The default policy as this file amends it, or the policy of the file alone if that says so.
/// A wrong file is a Failure.
[[nodiscard]] Policy readPolicy(const std::filesystem::path& path, const CodeBook& book);

/// The same with a document in memory.
[[nodiscard]] Policy amendedPolicy(const settings::Table& document, const CodeBook& book);

}  // namespace raidinfo::health
