#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

#include "health/severity.h"
#include "inventory/records.h"

namespace raidinfo::health {

/// A field that made a rule speak.
struct Fact {
    std::string field;
    Value value;
    std::optional<std::string> codeName;  ///< of a number that the code book knows
    std::string shown;                    ///< "4 (failed)"
};

/// The record that a finding is about.
struct Culprit {
    std::string kind;
    std::optional<std::size_t> position;  ///< none where nothing is published
    std::string address;
};

struct Finding {
    Severity severity;
    std::string rule;
    std::string message;
    Culprit record;
    std::vector<Fact> facts;
};

/// What became of a rule, whether it found anything or not.
struct Checked {
    std::string rule;
    std::string place;  ///< "health.toml:12"
    Severity severity;
    bool enabled;
    std::vector<std::string> kinds;
    std::string condition;  ///< "state is failed"
    std::size_t records = 0;
    std::size_t findings = 0;
};

/// How many records of a kind the machine has.
struct Population {
    std::string kind;
    std::size_t records = 0;
};

/// The state of the whole machine and what it rests on.
struct Verdict {
    Severity severity = Severity::unknown;
    std::string reason;             ///< why nothing could be judged
    std::vector<Finding> findings;  ///< those that decide first
    std::vector<Checked> checked;
    std::vector<Population> machine;
};

/// The state of a machine of which nothing could be learned, for example as its service is silent.
[[nodiscard]] Verdict unknownBecause(const std::string& reason);

/// 0 ok, 1 warning, 2 critical, 3 unknown.
[[nodiscard]] int exitStatus(const Verdict& verdict);

}  // namespace raidinfo::health
