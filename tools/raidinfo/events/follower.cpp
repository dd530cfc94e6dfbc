#include "events/follower.h"

#include <algorithm>
#include <chrono>
#include <limits>
#include <optional>
#include <string>

#include "events/gap_search.h"
#include "events/wait.h"
#include "source/exchange.h"
#include "source/service_failures.h"
#include "system/alarm.h"
#include "system/backoff.h"

namespace raidinfo {
namespace {

/// An answering service whose events could not be read this often in a row sends malformed ones.
constexpr int malformedReads = 5;

constexpr std::chrono::milliseconds pauseOfRestart{200};

std::string told(const MissingNumbers& missing) {
    return missing.first == missing.last ? "event " + std::to_string(missing.first) + " is missing"
                                         : "events " + std::to_string(missing.first) + " to " +
                                               std::to_string(missing.last) + " are missing";
}

class Follower {
public:
    Follower(const Library& library, const StreamStart& start, const EventListener& told)
        : wait{library},
          service{library},
          gap{library},
          askNewest{library.function<int()>("enableRAIDEvent")},
          nextNumber{library.variable<int>("nextSequenceNumber")},
          cancel{library.function<void()>("cancelGetEvent")},
          listener{told},
          beginning{start} {}

    /// One wait and what it brings; false when the listener has seen enough.
    bool step(const std::stop_token& stop) {
        if (!isServiceThere(stop)) {
            return true;
        }
        const auto last = continuity->last();
        const bool wentBack = last && newest < *last && newest != trusted;
        if (last && newest <= *last && !wentBack && !mayBeLate && !awaitNext(stop)) {
            return true;
        }
        const std::int64_t from = wentBack ? newest : continuity->overlapping();
        const Awaited awaited = wait.from(from);
        if (stop.stop_requested()) {
            return true;
        }
        if (awaited.outcome != Awaited::Outcome::read) {
            examineFailure(awaited.outcome, stop);
            return true;
        }
        failedReads = 0;
        mayBeLate = false;
        if (last && from <= *last && !isContinued(awaited.events, wentBack, *last, stop)) {
            return true;
        }
        return show(awaited.events, from, stop);
    }

private:
    /// Before each wait: a service that was restarted would let a wait for the old numbers hang.
    bool isServiceThere(const std::stop_token& stop) {
        if (!isAnswering()) {
            if (!stop.stop_requested()) {
                waitForService(stop);
            }
            return false;
        }
        newest = *nextNumber;
        if (!continuity) {
            begin();
        }
        continuity->heedNewest(newest);
        if (isAway) {
            isAway = false;
            trusted = -1;
            mayBeLate = true;  // It may be another one, or have begun to count anew.
            backoff.reset();
            listener.notice({"service_available", "the RAID management service answers again"});
        }
        return true;
    }

    /// Only the first answer is a matter of patience: later a silent service is waited for.
    [[nodiscard]] bool isAnswering() const {
        const Alarm alarm{continuity ? std::nullopt : beginning.patience, cancel};
        const bool answers = askNewest() != 0;
        if (!answers && alarm.over().stop_requested()) {
            throw noAnswerInTime();
        }
        return answers;
    }

    void begin() {
        if (beginning.shownBefore) {
            continuity = Continuity::after(*beginning.shownBefore);
            return;
        }
        const std::int64_t first = beginning.first.value_or(newest);
        continuity = Continuity{first};
        listener.begin(first);
        if (first > newest) {
            listener.notice({"waiting_for_event", "the newest event is " + std::to_string(newest) +
                                                      "; waiting for event " +
                                                      std::to_string(first)});
        }
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

    /// Waits for an event behind the last one shown. The library's own wait would be followed by
    /// the events from the same number on, so that an event which used the last number once more
    /// meanwhile would be missed.
    [[nodiscard]] bool awaitNext(const std::stop_token& stop) {
        const Alarm alarm{beginning.interval, cancel, stop};
        if (service.nextEvent(continuity->next() - 1)) {
            return true;
        }
        if (alarm.rang()) {
            mayBeLate = true;
        } else if (!stop.stop_requested()) {
            examineFailure(Awaited::Outcome::failed, stop);
        }
        return false;
    }

    /// Looks whether the service still tells of the events that were shown; if not, it has begun to
    /// count anew, and what it has is asked for from the beginning.
    bool isContinued(const Records& records, bool wentBack, std::int64_t last,
                     const std::stop_token& stop) {
        if (beginsAnew(*continuity, records, wentBack, listener)) {
            // One that says something else each time must not keep this program busy.
            pauseUnlessStopped(pauseOfRestart, stop);
            return false;
        }
        if (wentBack && !records.empty()) {
            const std::int64_t greatest = greatestNumber(records);
            if (greatest < last) {
                continuity->shrinkTo(greatest);
            } else {
                trusted = newest;  // The events are only in disorder.
            }
        }
        return true;
    }

    bool show(const Records& records, std::int64_t from, const std::stop_token& stop) {
        const std::int64_t before = continuity->next();
        bool anyFresh = false;
        const EventListener watched{[&](const Record& event) {
                                        anyFresh = true;
                                        return listener.show(event);
                                    },
                                    listener.notice, listener.begin};
        const bool more = showBatch(*continuity, records, watched);
        const std::int64_t behind = from + numbersAsked;
        if (anyFresh) {
            backoff.reset();
            mayBeLate = continuity->waitsForLateEvents();
        } else if (continuity->next() == before) {
            // Otherwise they were shown before the service lost them, and are there again.
            if (newest >= behind && (records.empty() || greatestNumber(records) < before)) {
                passOver(before, behind, stop);
            } else {
                backoff.wait(stop);
            }
        }
        return more;
    }

    /// The window that ends before `behind` holds nothing from `first` on.
    void passOver(std::int64_t first, std::int64_t behind, const std::stop_token& stop) {
        const auto least = gap.leastNumber(first, newest, stop);
        continuity->passOverTo(least ? std::max(*least, first) : behind);
    }

    /// Whoever answers next may be another service, or the same that counts anew.
    void examineFailure(Awaited::Outcome outcome, const std::stop_token& stop) {
        failedReads = outcome == Awaited::Outcome::malformed ? failedReads + 1 : 0;
        if (failedReads == malformedReads) {
            throw malformedAnswer();
        }
        trusted = -1;
        mayBeLate = true;
        backoff.wait(stop);
    }

    EventWait wait;
    Exchange service;
    GapSearch gap;
    int (*askNewest)();
    const int* nextNumber;  ///< the library's, which askNewest sets to the newest
    void (*cancel)();
    const EventListener& listener;
    StreamStart beginning;
    std::optional<Continuity> continuity;  ///< from the first answer on
    Backoff backoff;
    std::int64_t newest = 0;    ///< when the service was asked last
    std::int64_t trusted = -1;  ///< a newest number below the last shown that means nothing
    bool mayBeLate = false;     ///< a look for events that are missing is due
    int failedReads = 0;
    bool isAway = false;
};

}  // namespace

bool beginsAnew(Continuity& continuity, const Records& batch, bool wentBack,
                const EventListener& listener) {
    using History = Continuity::History;
    const History history = continuity.compared(batch);
    const bool contradicts = history == History::different;
    const bool knowsNothing = wentBack && history == History::unknown && !batch.empty();
    if (!continuity.last() || !(contradicts || knowsNothing)) {
        return false;
    }
    listener.notice({numbersWentBack, "the service no longer has the events that it had up to " +
                                          std::to_string(*continuity.last()) +
                                          "; it has begun to count anew"});
    continuity.beginAnew();
    return true;
}

bool showBatch(Continuity& continuity, const Records& batch, const EventListener& listener) {
    const Continuity::Accepted accepted = continuity.accept(batch);
    // Each gap is told where it is, so that a reader who has seen enough hears of none behind it.
    auto gap = accepted.missing.begin();
    const auto tellGapsBelow = [&](std::int64_t number) {
        for (; gap != accepted.missing.end() && gap->first < number; ++gap) {
            listener.notice({"events_missing", told(*gap)});
        }
    };
    for (const std::size_t place : accepted.fresh) {
        tellGapsBelow(numberOf(eventKind(), batch[place], "sequence_number"));
        if (!listener.show(batch[place])) {
            return false;
        }
    }
    tellGapsBelow(std::numeric_limits<std::int64_t>::max());
    return true;
}

void followEvents(const Library& library, const StreamStart& start, const EventListener& listener,
                  const std::stop_token& stop) {
    Follower follower{library, start, listener};
    while (!stop.stop_requested() && follower.step(stop)) {
    }
}

}  // namespace raidinfo
