#pragma once

#include <algorithm>
#include <deque>
#include <functional>
#include <string>
#include <unordered_map>
#include <utility>
#include <vector>

#include "diff/entries.h"

namespace raidinfo::diff {

/// Which records of one sort are the same in both trees.
struct Matching {
    struct Pair {
        const Entry* before;
        const Entry* after;
        bool bySerial;
    };

    std::vector<Pair> both = {};
    std::vector<const Entry*> removed = {};
    std::vector<const Entry*> added = {};
};

/// The serial number without blanks around it; empty where the record has none.
[[nodiscard]] std::string serialOf(const Entry& entry);

/// The number of the record in that which it stands in, which is one thing in both trees.
[[nodiscard]] std::string addressOf(const Entry& entry);

/// The records of both trees that have a serial number or an address in common.
struct Alike {
    std::vector<Entry*> before = {};
    std::vector<Entry*> after = {};

    [[nodiscard]] bool isUnique() const { return before.size() == 1 && after.size() == 1; }
};

/// Matches records of one address: those that are equal first, whatever their order.
void matchAlike(Alike alike, const std::string& address, Matching& matching);

/// Puts the entries that are still unmatched together by their key; an empty key is none.
template <typename Same>
class Lookup {
public:
    using KeyOf = std::string (*)(const Entry&);

    Lookup(std::deque<Entry>& before, std::deque<Entry>& after, KeyOf keyOf, const Same& same)
        : byKey(before.size(), std::hash<std::string>{}, same) {
        add(before, &Alike::before, keyOf);
        add(after, &Alike::after, keyOf);
    }

    auto begin() { return byKey.begin(); }
    auto end() { return byKey.end(); }

private:
    void add(std::deque<Entry>& entries, std::vector<Entry*> Alike::*side, KeyOf keyOf) {
        for (Entry& entry : entries) {
            if (!entry.identity.empty()) {
                continue;
            }
            if (std::string key = keyOf(entry); !key.empty()) {
                (byKey[std::move(key)].*side).push_back(&entry);
            }
        }
    }

    std::unordered_map<std::string, Alike, std::hash<std::string>, Same> byKey;
};

/// Matches the records of one sort; those that they are numbered in have been matched. `same`
/// compares keys; the tests count how often.
template <typename Same = std::equal_to<>>
[[nodiscard]] Matching matched(std::deque<Entry>& before, std::deque<Entry>& after,
                               const Same& same = {}) {
    Matching matching;
    for (auto& [serial, alike] : Lookup{before, after, serialOf, same}) {
        if (alike.isUnique()) {
            alike.before.front()->identity = alike.after.front()->identity = "serial " + serial;
            matching.both.push_back({alike.before.front(), alike.after.front(), true});
        }
    }
    for (auto& [address, alike] : Lookup{before, after, addressOf, same}) {
        matchAlike(std::move(alike), address, matching);
    }
    return matching;
}

}  // namespace raidinfo::diff
