#include "watch/latest_events.h"

#include <algorithm>
#include <cstddef>
#include <utility>

#include "events/event_line.h"
#include "events/follower.h"
#include "library/library.h"

namespace raidinfo {
namespace {

constexpr std::size_t shownEvents = 3;

const EventListener silent{[](const Record& /*event*/) { return true; },
                           [](const Notice& /*notice*/) {}};

}  // namespace

std::int64_t LatestEvents::awaited(std::int64_t newest) const {
    const std::int64_t next = newest + 1;
    if (!continuity) {
        return next;
    }
    if (newest < continuity->last().value_or(0)) {
        return std::max<std::int64_t>(newest, 1);
    }
    // The newest must be among the numbers that the library asks for.
    return std::clamp<std::int64_t>(continuity->next(),
                                    std::max<std::int64_t>(next - numbersAsked, 1), next);
}

std::int64_t LatestEvents::readFrom(std::int64_t awaitedNumber) const {
    const bool isRightBehind = continuity && continuity->last() == awaitedNumber - 1;
    return isRightBehind ? awaitedNumber - 1 : awaitedNumber;
}

bool LatestEvents::take(const Records& batch, std::int64_t newest) {
    if (!continuity) {
        continuity.emplace(newest + 1);
    }
    const bool wentBack = continuity->last() && newest < *continuity->last();
    static_cast<void>(beginsAnew(*continuity, batch, wentBack, silent));
    const auto fresh = continuity->accept(batch).fresh;
    for (const std::size_t place : fresh) {
        std::string line = eventLine(batch[place]);
        line.pop_back();
        latest.push_back(std::move(line));
    }
    if (latest.size() > shownEvents) {
        latest.erase(latest.begin(), latest.end() - static_cast<std::ptrdiff_t>(shownEvents));
    }
    return !fresh.empty();
}

}  // namespace raidinfo
