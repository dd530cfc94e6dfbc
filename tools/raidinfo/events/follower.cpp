#include "events/follower.h"

#include <algorithm>
#include <limits>
#include <optional>
#include <string>

#include "source/service_failures.h"
#include "system/backoff.h"

namespace raidinfo {
namespace {

/// An answering service whose events could not be read this often in a row sends malformed ones.
constexpr int malformedReads = 5;

/// The library asks for so many numbers at once.
constexpr std::int64_t numbersAsked = 101;

std::string told(const MissingNumbers& missing) {
    return missing.first == missing.last ? "event " + std::to_string(missing.first) + " is missing"
                                         : "events " + std::to_string(missing.first) + " to " +
                                               std::to_string(missing.last) + " are missing";
}

class Follower {
public:
    Follower(const Library& library, const StreamStart& start, const EventListener& told)
        : reader{library},
          askNewest{library.function<int()>("enableRAIDEvent")},
          newest{library.variable<int>("nextSequenceNumber")},
          setNext{library.function<void(int)>("setRAIDEventSequenceNumber")},
          waitForEvents{library.function<int()>("getEvent")},
          batch{library.variable<const void*>("raidEvents")},
          listener{told},
          beginning{start} {}

    /// One wait and what it brings; false when the listener has seen enough.
    bool step(const std::stop_token& stop) {
        if (!isServiceThere(stop)) {
            return true;
        }
        const std::int64_t next = continuity->next();
        const std::int64_t newestBefore = *newest;
        setNext(static_cast<int>(std::min<std::int64_t>(next, std::numeric_limits<int>::max())));
        waitForEvents();
        if (stop.stop_requested()) {
            return true;
        }
        const Records records = reader.read(eventKind());
        const auto before = continuity->last();
        const bool more = showBatch(*continuity, records, listener);
        if (continuity->last() != before) {
            failedReads = 0;
            backoff.reset();
        } else if (*batch != nullptr && records.empty() && newestBefore >= next + numbersAsked) {
            continuity->passOverTo(next + numbersAsked);
        } else {
            examineReadOfNothing(stop);
        }
        return more;
    }

private:
    /// Before each wait: a service that was restarted would let a wait for the old numbers hang.
    bool isServiceThere(const std::stop_token& stop) {
        if (askNewest() == 0) {
            if (!stop.stop_requested()) {
                waitForService(stop);
            }
            return false;
        }
        if (!continuity) {
            continuity = beginning.shownBefore ? Continuity::after(*beginning.shownBefore)
                                               : Continuity{beginning.first.value_or(*newest)};
        }
        if (isAway) {
            isAway = false;
            backoff.reset();
            listener.notice({"service_available", "the RAID management service answers again"});
        }
        const auto last = continuity->last();
        if (continuity->beganAnew(*newest)) {
            listener.notice({numbersWentBack, "the service's newest event is " +
                                                  std::to_string(*newest) + " after " +
                                                  std::to_string(*last) +
                                                  "; it has begun to count anew"});
        }
        return true;
    }

    void waitForService(const std::stop_token& stop) {
        if (!continuity) {
            throw serviceUnavailable();
        }
        if (!isAway) {
            listener.notice({"service_unavailable",
                             "the RAID management service does not answer; waiting for it"});
        }
        isAway = true;
        backoff.wait(stop);
    }

    /// Fails if nothing new comes because of malformed answers; an empty batch is none.
    void examineReadOfNothing(const std::stop_token& stop) {
        failedReads = *batch == nullptr ? failedReads + 1 : 0;
        if (failedReads == malformedReads) {
            throw malformedAnswer();
        }
        backoff.wait(stop);
    }

    RecordReader reader;
    int (*askNewest)();
    const int* newest;  ///< the library's next number, which askNewest sets to the newest
    void (*setNext)(int);
    int (*waitForEvents)();
    const void* const* batch;  ///< the library's: null after a malformed answer
    const EventListener& listener;
    StreamStart beginning;
    std::optional<Continuity> continuity;  ///< from the first answer on
    Backoff backoff;
    int failedReads = 0;
    bool isAway = false;
};

}  // namespace

bool showBatch(Continuity& continuity, const Records& batch, const EventListener& listener) {
    const auto [fresh, missing] = continuity.accept(batch);
    for (const MissingNumbers& numbers : missing) {
        listener.notice({"events_missing", told(numbers)});
    }
    return std::ranges::all_of(
        fresh, [&](const std::size_t place) { return listener.show(batch[place]); });
}

void followEvents(const Library& library, const StreamStart& start, const EventListener& listener,
                  const std::stop_token& stop) {
    Follower follower{library, start, listener};
    while (!stop.stop_requested() && follower.step(stop)) {
    }
}

}  // namespace raidinfo
