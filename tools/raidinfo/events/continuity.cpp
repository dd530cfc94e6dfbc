#include "events/continuity.h"

#include <algorithm>
#include <iterator>
#include <numeric>
#include <set>
#include <string_view>

#include "library/library.h"
#include "overloaded.h"

namespace raidinfo {
namespace {

/// As many events are known by their content, and as many gaps may still be filled.
constexpr std::size_t memory = 10'000;

/// If the library begins to ask so far below the last one shown, there is still one ahead among
/// the numbers that it asks for.
constexpr std::int64_t overlap = numbersAsked - 2;

std::int64_t numberOf(const Record& event) {
    return raidinfo::numberOf(eventKind(), event, "sequence_number");
}

/// FNV-1a.
class Fingerprint {
public:
    void add(std::string_view bytes) {
        for (const char byte : bytes) {
            value = (value ^ static_cast<unsigned char>(byte)) * 0x100000001b3U;
        }
        value = (value ^ 0xFFU) * 0x100000001b3U;  // ends the field
    }
    [[nodiscard]] std::uint64_t result() const noexcept { return value; }

private:
    std::uint64_t value = 0xcbf29ce484222325U;
};

}  // namespace

std::uint64_t contentOf(const Record& event) {
    Fingerprint fingerprint;
    for (const Value& field : event) {
        std::visit(Overloaded{[&](int number) { fingerprint.add(std::to_string(number)); },
                              [&](const std::string& text) { fingerprint.add(text); },
                              [](const auto&) {}},  // no event has other fields
                   field);
    }
    return fingerprint.result();
}

Continuity Continuity::after(const LastShown& last) {
    if (last.number == 0) {
        return Continuity{0};  // There was no event yet, and nobody knows the number of the first.
    }
    Continuity continuity{last.number + 1};
    continuity.greatest = last.number;
    if (last.content) {
        continuity.remember(last.number, *last.content);
    }
    return continuity;
}

Continuity::Accepted Continuity::accept(const Records& batch) {
    std::vector<std::size_t> places(batch.size());
    std::iota(places.begin(), places.end(), std::size_t{0});
    std::ranges::stable_sort(places, {}, [&](std::size_t place) { return numberOf(batch[place]); });
    Accepted accepted;
    std::set<std::int64_t> ahead;
    for (const std::size_t place : places) {
        const std::int64_t number = numberOf(batch[place]);
        const std::uint64_t content = contentOf(batch[place]);
        if (number >= expected) {
            ahead.insert(number);
        }
        const bool fresh = isFresh(number, content);
        if (fresh) {
            accepted.fresh.push_back(place);
        }
        if (fresh || shown.contains({number, content})) {
            remember(number, content);
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

/// What was shown before the service began to count anew says nothing of the events that it has
/// now.
Continuity::History Continuity::compared(const Records& batch) const {
    std::map<std::int64_t, bool> isThere;  // by the numbers that were shown: any event that was
    for (const Record& event : batch) {
        const Event looked{numberOf(event), contentOf(event)};
        if (looked.first > greatest.value_or(0)) {
            continue;  // It may be one of those that the service has lost and now counts again.
        }
        for (auto known = shown.lower_bound({looked.first, 0});
             known != shown.end() && known->first.first == looked.first; ++known) {
            if (known->second == count) {
                isThere[looked.first] |= known->first == looked;
            }
        }
    }
    if (isThere.empty()) {
        return History::unknown;
    }
    const bool all = std::ranges::all_of(isThere, [](const auto& number) { return number.second; });
    return all ? History::same : History::different;
}

void Continuity::beginAnew() {
    expected = 0;
    asked = 0;
    greatest.reset();
    missingUntil.clear();
    ++count;
}

void Continuity::shrinkTo(std::int64_t number) {
    expected = number + 1;
    asked = 0;
    greatest = number;
}

std::int64_t Continuity::next() const noexcept { return std::max(expected, asked); }

std::int64_t Continuity::overlapping() const {
    if (!greatest || asked > expected) {
        return next();
    }
    const std::int64_t lowest = std::max<std::int64_t>(*greatest - overlap, 1);
    const auto above = missingUntil.upper_bound(lowest);
    if (above != missingUntil.begin() && std::prev(above)->second >= lowest) {
        return lowest;
    }
    return above == missingUntil.end() ? *greatest : std::min(above->first, *greatest);
}

/// An event with the number of another one that was shown is new when it says something else.
bool Continuity::isFresh(std::int64_t number, std::uint64_t content) {
    const auto known = shown.lower_bound({number, 0});
    if (known != shown.end() && known->first.first == number) {
        return !shown.contains({number, content});
    }
    return number >= expected || takeFromMissing(number);
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

void Continuity::remember(std::int64_t number, std::uint64_t content) {
    const Event event{number, content};
    if (shown.insert_or_assign(event, count).second) {
        order.push_back(event);
    }
    if (order.size() > memory) {
        shown.erase(order.front());
        order.pop_front();
    }
}

}  // namespace raidinfo
