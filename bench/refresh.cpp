// Whole refreshes and event batches over the loopback, from request to published lists, against
// the exchange of the same bytes alone; and what the log adds.
//
//   bench_refresh DOCUMENT [arguments of the harness]
//
// names what the service answers with, which must be listening and keep a hundred events.

#include <filesystem>

#include "RAIDInstrumentation.h"
#include "agent/agent_link.h"
#include "agent/document.h"
#include "agent/exchange.h"
#include "agent/requests.h"
#include "diag/debug.h"
#include "flat/lists.h"
#include "flat/snapshot.h"
#include "harness/harness.h"
#include "readers/reader.h"

namespace {

using namespace raid;
using namespace raid::bench;

agent::Document answerTo(const std::string& request) {
    return agent::Document(getSOAPData(request.c_str()));
}

/// As the library would if it were built on the reader.
void refreshWith(const Reader& reader) {
    agent::Document answer(getSOAPData(0));
    const auto length = static_cast<int>(std::string_view(answer.get()).size());
    reader.read(std::move(answer), length);
    flat::publish(*reader.model());
}

constexpr int firstEvent = 1;
constexpr int batchSize = 100;

void readBatch() {
    setRAIDEventSequenceNumber(firstEvent);
    getEvent();
}

/// The two exchanges of a batch: the wait, which is over at once, and the events.
void exchangeBatch() {
    use(answerTo(agent::waitNextEventRequest(firstEvent - 1)));
    use(answerTo(agent::eventsRequest(firstEvent, firstEvent + batchSize)));
}

std::chrono::nanoseconds timeOfLoggedRefresh(int level) {
    LOG_LEVEL = level;
    const auto time = passingTime([] { RAIDinit(); });
    LOG_LEVEL = 0;
    return time;
}

/// As it is written from the folder that scripts/bench runs this in.
void requireLog() {
    LOG_LEVEL = 1;
    debug(1, "measured\n");
    LOG_LEVEL = 0;
    if (!std::filesystem::exists("../logs/RAIDInstrumentation.log")) {
        throw std::runtime_error("the log cannot be written from here");
    }
}

std::chrono::nanoseconds timeOfCallsBelowTheLevel(int calls) {
    return processorTime([calls] {
        for (int i = 0; i < calls; ++i) {
            debug(9, "not written\n");
        }
    });
}

std::vector<Benchmark> benchmarksFor(const std::string& document) {
    configRead = 1;
    requireLog();
    RAIDinit();
    if (RAIDDiskDriveList.empty()) {
        throw std::runtime_error("no service answers with a configuration");
    }
    readBatch();
    if (RAIDEventList.size() != batchSize) {
        throw std::runtime_error("the service has not a hundred events");
    }
    const auto measured = [](std::string name, auto work) {
        return Benchmark{std::move(name), 1, [work] { return passingTime(work); }};
    };
    std::vector<Benchmark> made{
        measured("refresh/" + document + "/exchange", [] { use(agent::Document(getSOAPData(0))); }),
        measured("refresh/" + document + "/library", [] { RAIDinit(); }),
        measured("batch/100 events beside " + document + "/exchange", &exchangeBatch),
        measured("batch/100 events beside " + document + "/library", &readBatch),
    };
    for (const auto& reader : readers().subspan(1)) {
        made.push_back(measured("refresh/" + document + "/" + std::string(reader.name),
                                [&reader] { refreshWith(reader); }));
    }
    for (const int level : {0, 1, 8}) {
        made.push_back({"log/a refresh of " + document + " at level " + std::to_string(level), 1,
                        [level] { return timeOfLoggedRefresh(level); }});
    }
    constexpr int calls = 1000;
    made.push_back({"log/" + std::to_string(calls) + " calls below the level beside " + document,
                    calls, [] { return timeOfCallsBelowTheLevel(calls); }});
    return made;
}

}  // namespace

int main(int argc, char** argv) { return measureAll(&benchmarksFor, argc, argv); }
