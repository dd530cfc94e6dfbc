#include "diff/diff.h"

#include <algorithm>
#include <unordered_set>
#include <utility>

#include "diff/details.h"
#include "diff/entries.h"
#include "diff/matching.h"

namespace raidinfo::diff {
namespace {

/// A record is as much worse or better as the weightiest of its details that is either.
Direction directionOf(const std::vector<Detail>& details) {
    const auto found = std::ranges::find_if(
        details, [](const Detail& detail) { return detail.direction != Direction::neutral; });
    return found == details.end() ? Direction::neutral : found->direction;
}

Change described(const Entry& entry, Type type, Direction direction) {
    return {.type = type,
            .direction = direction,
            .kind = entry.subject->key,
            .noun = entry.subject->noun,
            .place = entry.place(),
            .origin = {},
            .former = {},
            .details = {}};
}

/// The place that a record was moved from, from the first number that is another now.
std::string originOf(const Subject& subject, const Place& former, const Place& place) {
    auto step = std::ranges::mismatch(former, place, {}, &Step::number, &Step::number).in1;
    if (step == former.end()) {
        // The adapters have changed places.
        step = former.begin();
    }
    std::string origin{subject.traits.moved};
    for (; step != former.end(); ++step) {
        origin += " " + std::string{step->label} + " " + step->number.dump();
    }
    return origin;
}

bool isMoved(const Matching::Pair& pair) {
    return pair.bySerial && addressOf(*pair.before) != addressOf(*pair.after);
}

bool isReplaced(const Matching::Pair& pair) {
    const std::string before = serialOf(*pair.before);
    const std::string after = serialOf(*pair.after);
    return !before.empty() && !after.empty() && before != after;
}

Type typeOf(const Matching::Pair& pair) {
    if (isMoved(pair)) {
        return Type::moved;
    }
    return isReplaced(pair) ? Type::replaced : Type::changed;
}

bool isBefore(const Change& left, const Change& right) {
    return std::ranges::lexicographical_compare(left.place, right.place, {}, &Step::number,
                                                &Step::number);
}

/// Compares the records of one sort after the other.
class Comparison {
public:
    Comparison(const Json& before, const Json& after, const CodeBook& codes)
        : former{before}, present{after}, book{codes} {}

    std::vector<Change> run() {
        for (const Subject& subject : subjects()) {
            const auto first = static_cast<std::ptrdiff_t>(found.size());
            compare(subject);
            std::stable_sort(found.begin() + first, found.end(), isBefore);
        }
        std::ranges::stable_sort(found, {}, [](const Change& change) -> const Json& {
            return change.place.front().number;
        });
        return std::move(found);
    }

private:
    void compare(const Subject& subject) {
        const Matching matching = matched(former.of(subject.id), present.of(subject.id));
        for (const Matching::Pair& pair : matching.both) {
            compare(pair);
        }
        tell(matching.removed, Type::removed, Direction::worse);
        tell(matching.added, Type::added, Direction::better);
    }

    void compare(const Matching::Pair& pair) {
        std::vector<Detail> details = differences(*pair.before, *pair.after, book);
        const Type type = typeOf(pair);
        if (type == Type::changed && details.empty()) {
            return;
        }
        Change& change = found.emplace_back(described(*pair.after, type, directionOf(details)));
        change.details = std::move(details);
        if (type == Type::moved) {
            change.former = pair.before->place();
            change.origin = originOf(*pair.after->subject, change.former, change.place);
        }
    }

    void tell(const std::vector<const Entry*>& entries, Type type, Direction direction) {
        for (const Entry* const entry : entries) {
            if (entry->subject->traits.isPart && comeOrGone.contains(entry->within)) {
                continue;
            }
            comeOrGone.insert(entry);
            Change& change = found.emplace_back(described(*entry, type, direction));
            change.details = description(*entry, type, book);
        }
    }

    Entries former;
    Entries present;
    const CodeBook& book;
    std::vector<Change> found;
    std::unordered_set<const Entry*> comeOrGone;
};

}  // namespace

std::vector<Change> changes(const Json& before, const Json& after, const CodeBook& book) {
    return Comparison{before, after, book}.run();
}

}  // namespace raidinfo::diff
