#include "events/continuity.h"

#include <algorithm>
#include <functional>
#include <set>
#include <string>
#include <string_view>

#include "presentation/table.h"

namespace raidinfo {
namespace {

/// As many events are known by their content, and as many gaps may still be filled.
constexpr std::size_t memory = 10'000;

std::int64_t numberOf(const Record& event) {
    return raidinfo::numberOf(eventKind(), event, "sequence_number");
}

std::size_t contentHash(const Record& event) {
    std::string content;
    for (const Value& value : event) {
        content += shown(value) + '\n';
    }
    return std::hash<std::string>{}(content);
}

}  // namespace

Continuity Continuity::after(std::int64_t last) {
    Continuity continuity{last + 1};
    continuity.greatest = last;
    return continuity;
}

Continuity::Accepted Continuity::accept(const Records& batch) {
    Accepted accepted;
    std::set<std::int64_t> ahead;
    for (std::size_t place = 0; place < batch.size(); ++place) {
        const std::int64_t number = numberOf(batch[place]);
        const bool isAhead = number >= expected;
        if (isAhead ? !ahead.insert(number).second : !takeFromMissing(number)) {
            continue;
        }
        if (!wasShown(number, batch[place])) {
            accepted.fresh.push_back(place);
            remember(number, batch[place]);
        }
    }
    std::int64_t awaited = expected == 0 && !ahead.empty() ? *ahead.begin() : expected;
    for (const std::int64_t number : ahead) {
        if (number > awaited) {
            accepted.missing.push_back({awaited, number - 1});
            missingUntil[awaited] = number - 1;
        }
        awaited = number + 1;
    }
    while (missingUntil.size() > memory) {
        missingUntil.erase(missingUntil.begin());
    }
    if (!ahead.empty()) {
        expected = awaited;
        greatest = std::max(greatest.value_or(0), *ahead.rbegin());
    }
    return accepted;
}

bool Continuity::beganAnew(std::int64_t newest) {
    if (!greatest || newest >= *greatest) {
        return false;
    }
    expected = 0;
    asked = 0;
    greatest.reset();
    missingUntil.clear();
    return true;
}

bool Continuity::wasShown(std::int64_t number, const Record& event) const {
    const auto found = shown.find(number);
    return found != shown.end() && found->second == contentHash(event);
}

bool Continuity::takeFromMissing(std::int64_t number) {
    const auto after = missingUntil.upper_bound(number);
    if (after == missingUntil.begin() || std::prev(after)->second < number) {
        return false;
    }
    const auto [first, last] = *std::prev(after);
    missingUntil.erase(first);
    if (first < number) {
        missingUntil[first] = number - 1;
    }
    if (number < last) {
        missingUntil[number + 1] = last;
    }
    return true;
}

void Continuity::remember(std::int64_t number, const Record& event) {
    if (shown.insert_or_assign(number, contentHash(event)).second) {
        order.push_back(number);
    }
    if (order.size() > memory) {
        shown.erase(order.front());
        order.pop_front();
    }
}

}  // namespace raidinfo
