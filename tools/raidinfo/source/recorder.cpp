#include "source/recorder.h"

#include <algorithm>
#include <cstdint>
#include <cstdlib>
#include <limits>
#include <memory>
#include <string>

#include "agent/requests.h"
#include "source/recorded.h"
#include "source/service_failures.h"
#include "system/alarm.h"
#include "system/backoff.h"

namespace raidinfo {
namespace {

using recording::Question;
using Clock = std::chrono::steady_clock;

/// The library asks for so many numbers at once, and so does the recorder.
constexpr std::int64_t numbersAsked = 101;

class Recorder {
public:
    Recorder(const Library& loaded, const EntrySink& destination)
        : library{loaded},
          exchange{loaded.function<char*(const char*)>("_Z11getSOAPDataPKc")},
          reader{loaded},
          sink{destination} {}

    /// The configuration and all events that there are. Returns whether the service answers.
    bool recordAll() {
        const auto configuration = ask(raid::agent::configurationRequest);
        if (!configuration) {
            return false;
        }
        add(Question::configuration, configuration);
        add(Question::newestEvent, ask(raid::agent::newestEventRequest()));
        const auto events = ask(raid::agent::eventListRequest);
        add(Question::events, events);
        learnNumbers(events);
        return true;
    }

    /// Waits for an event after those that were recorded, then records the new ones and the
    /// configuration. Returns whether the service answers.
    bool recordNext(const std::stop_token& stop) {
        if (!ask(raid::agent::waitNextEventRequest(bounded(last)))) {
            if (!stop.stop_requested()) {
                add(Question::events, std::nullopt);
            }
            return false;
        }
        const auto events =
            ask(raid::agent::eventsRequest(bounded(last + 1), bounded(last + numbersAsked)));
        add(Question::events, events);
        learnNumbers(events);
        add(Question::configuration, ask(raid::agent::configurationRequest));
        return true;
    }

private:
    static int bounded(std::int64_t number) {
        return static_cast<int>(std::min<std::int64_t>(number, std::numeric_limits<int>::max()));
    }

    [[nodiscard]] std::optional<std::string> ask(const std::string& request) const {
        struct Free {
            void operator()(char* bytes) const {
                std::free(
                    bytes);  // NOLINT(cppcoreguidelines-no-malloc): the library's is malloc'ed
            }
        };
        const std::unique_ptr<char, Free> body{exchange(request.c_str())};
        return body ? std::optional<std::string>{body.get()} : std::nullopt;
    }

    void add(Question question, std::optional<std::string> body) const {
        sink({std::chrono::duration_cast<std::chrono::milliseconds>(Clock::now() - start), question,
              std::move(body)});
    }

    void learnNumbers(const std::optional<std::string>& events) {
        const auto batch = events ? eventsIn(library, reader, *events) : std::nullopt;
        if (batch) {
            for (const Record& event : *batch) {
                const std::int64_t number = numberOf(eventKind(), event, "sequence_number");
                last = std::max(last, number);
            }
        }
    }

    const Library& library;
    char* (*exchange)(const char*);
    RecordReader reader;
    const EntrySink& sink;
    Clock::time_point start = Clock::now();
    std::int64_t last = 0;
};

}  // namespace

void recordAnswers(const Library& library, const EntrySink& sink,
                   std::optional<std::chrono::seconds> duration, const std::stop_token& stop) {
    Recorder recorder{library, sink};
    if (!recorder.recordAll()) {
        throw serviceUnavailable();
    }
    const auto end = Clock::now() + duration.value_or(std::chrono::seconds{0});
    const auto isOver = [&] { return stop.stop_requested() || (duration && Clock::now() >= end); };
    std::optional<Alarm> alarm;
    if (duration) {
        alarm.emplace(*duration, library.function<void()>("cancelGetEvent"));
    }
    Backoff backoff;
    while (!isOver()) {
        if (recorder.recordNext(stop)) {
            backoff.reset();
        } else if (!isOver()) {
            backoff.wait(stop);
        }
    }
}

}  // namespace raidinfo
