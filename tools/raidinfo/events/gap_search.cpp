#include "events/gap_search.h"

#include <algorithm>

#include "source/recorded.h"

namespace raidinfo {
namespace {

// The Python module searches with the same widths and goes on from the same number.
constexpr std::int64_t growth = 8;

/// The least number of a batch from `first` on.
std::optional<std::int64_t> leastIn(const Records& batch, std::int64_t first) {
    std::optional<std::int64_t> least;
    for (const Record& event : batch) {
        const std::int64_t number = numberOf(eventKind(), event, "sequence_number");
        if (number >= first) {
            least = std::min(least.value_or(number), number);
        }
    }
    return least;
}

}  // namespace

GapSearch::GapSearch(const Library& searched)
    : library{searched}, reader{searched}, service{searched} {}

std::optional<std::int64_t> GapSearch::leastNumber(std::int64_t first, std::int64_t last,
                                                   const std::stop_token& stop) {
    std::int64_t from = first;
    for (std::int64_t width = growth * numbersAsked; from <= last; width *= growth) {
        const std::int64_t end = std::min(from + width - 1, last);
        const auto answer = service.events(from, end);
        const auto batch = answer ? eventsIn(library, reader, *answer) : std::nullopt;
        if (!batch || stop.stop_requested()) {
            return std::nullopt;
        }
        if (const auto least = leastIn(*batch, from)) {
            return least;
        }
        from = end + 1;
    }
    // What comes late is a little below the last number; yet what was searched in vain is not asked
    // for again from its beginning, without end.
    return std::max(last - numbersAsked + 1, first + 1);
}

}  // namespace raidinfo
