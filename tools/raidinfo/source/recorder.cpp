#include "source/recorder.h"

#include <cstdint>
#include <map>
#include <string>
#include <utility>

#include "source/exchange.h"
#include "source/recorded.h"
#include "source/service_failures.h"
#include "system/alarm.h"
#include "system/backoff.h"

namespace raidinfo {
namespace {

using recording::Question;
using Clock = std::chrono::steady_clock;

class Recorder {
public:
    Recorder(const Library& loaded, const EntrySink& destination, std::stop_token whenOver)
        : library{loaded},
          service{loaded},
          askNewest{loaded.function<int()>("enableRAIDEvent")},
          newest{loaded.variable<int>("nextSequenceNumber")},
          reader{loaded},
          sink{destination},
          over{std::move(whenOver)} {}

    /// All events that there are, and the configuration. Returns whether the service answers.
    bool recordAll() {
        const auto newestEvent = service.newestEvent();
        const auto events = service.allEvents();
        const auto configuration = service.configuration();
        if (!configuration) {
            return false;
        }
        add(Question::configuration, configuration);
        add(Question::newestEvent, newestEvent);
        add(Question::events, events);
        last = greatestIn(events).value_or(0);
        return true;
    }

    /// Waits for events after those that were recorded, and records them. Returns whether there
    /// were any; if not, it is no use to ask again at once.
    bool recordNext() {
        if (askNewest() == 0) {
            add(Question::events, std::nullopt);
            isDoubtful = true;
            return false;
        }
        // A service that was restarted may count anew, and would let a wait for the old numbers
        // hang.
        const std::int64_t newestNumber = *newest;
        if (isDoubtful || newestNumber < last) {
            isDoubtful = !recordAll();
            return false;
        }
        if (newestNumber <= last && !service.nextEvent(last)) {
            isDoubtful = true;
            return false;
        }
        return recordEventsUpTo(newestNumber);
    }

private:
    /// The configuration is asked for after the events and written before them, so that it knows
    /// the names of all that they tell about.
    bool recordEventsUpTo(std::int64_t newestNumber) {
        // With the last one, for another event may use its number once more.
        auto events = service.events(last, last + numbersAsked);
        auto greatest = greatestIn(events);
        if (greatest && *greatest <= last && newestNumber > last + numbersAsked) {
            events = service.allEvents();  // The numbers asked for are passed over.
            greatest = greatestIn(events);
        }
        if (!events) {
            isDoubtful = true;
            return false;
        }
        if (greatest && *greatest <= last) {
            return false;
        }
        const auto configuration = service.configuration();
        if (over.stop_requested()) {
            return false;
        }
        isDoubtful = !configuration;
        add(Question::configuration, configuration);
        add(Question::events, events);
        last = greatest.value_or(last);
        return greatest.has_value();
    }

    /// What says nothing new is not written, lest a service that fails again and again fill the
    /// disk. An exchange that was ended from here tells nothing of the service.
    void add(Question question, const std::optional<std::string>& body) {
        const auto before = recorded.find(question);
        const bool isKnown = before != recorded.end() && before->second == body;
        if (isKnown || (!body && over.stop_requested())) {
            return;
        }
        recorded.insert_or_assign(question, body);
        sink({std::chrono::duration_cast<std::chrono::milliseconds>(Clock::now() - start), question,
              body});
    }

    /// The greatest number of a batch, 0 in an empty one; nothing where it cannot be read.
    [[nodiscard]] std::optional<std::int64_t> greatestIn(const std::optional<std::string>& events) {
        const auto batch = events ? eventsIn(library, reader, *events) : std::nullopt;
        return batch ? std::optional{greatestNumber(*batch)} : std::nullopt;
    }

    const Library& library;
    Exchange service;
    int (*askNewest)();
    const int* newest;  ///< the library's next number, which askNewest sets to the newest
    RecordReader reader;
    const EntrySink& sink;
    std::stop_token over;
    Clock::time_point start = Clock::now();
    std::map<Question, std::optional<std::string>> recorded;  ///< last of each question
    std::int64_t last = 0;                                    ///< number recorded
    bool isDoubtful = false;  ///< whether the service is the one that was asked before
};

}  // namespace

void recordAnswers(const Library& library, const EntrySink& sink, const RecordingTime& time,
                   const std::stop_token& stop) {
    std::stop_source over;
    const std::stop_callback stopped{stop, [&over] { over.request_stop(); }};
    const auto end = [&over, cancel = library.function<void()>("cancelGetEvent")] {
        over.request_stop();
        cancel();
    };
    const bool endsAtOnce = time.whole == std::chrono::seconds{0};
    std::optional<Alarm> alarm;
    std::optional<Alarm> ofFirstAnswer;
    if (time.whole && !endsAtOnce) {
        alarm.emplace(*time.whole, end);
    }
    if (time.firstAnswer) {
        ofFirstAnswer.emplace(*time.firstAnswer, end);
    }
    Recorder recorder{library, sink, over.get_token()};
    const bool isAnswered = recorder.recordAll();
    if (ofFirstAnswer && ofFirstAnswer->over().stop_requested() && !stop.stop_requested()) {
        throw noAnswerInTime();  // Some of it may be there.
    }
    if (!isAnswered) {
        throw over.stop_requested() ? noAnswerInTime("--for") : serviceUnavailable();
    }
    ofFirstAnswer.reset();
    if (endsAtOnce) {
        return;
    }
    Backoff backoff;
    while (!over.stop_requested()) {
        if (recorder.recordNext()) {
            backoff.reset();
        } else {
            backoff.wait(over.get_token());
        }
    }
}

}  // namespace raidinfo
