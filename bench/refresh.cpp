// Whole refreshes and event batches over the loopback, from request to published lists, against
// the exchange of the same bytes alone.
//
//   bench_refresh DOCUMENT [arguments of the harness]
//
// names what the service answers with, which must be listening and keep at least a hundred events.

#include "RAIDInstrumentation.h"
#include "agent/agent_link.h"
#include "agent/document.h"
#include "agent/exchange.h"
#include "agent/requests.h"
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

std::vector<Benchmark> benchmarksFor(const std::string& document) {
    configRead = 1;
    RAIDinit();
    if (RAIDDiskDriveList.empty()) {
        throw std::runtime_error("no service answers with a configuration");
    }
    readBatch();
    if (RAIDEventList.size() < batchSize) {
        throw std::runtime_error("the service has too few events");
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
    return made;
}

}  // namespace

int main(int argc, char** argv) { return measureAll(&benchmarksFor, argc, argv); }
