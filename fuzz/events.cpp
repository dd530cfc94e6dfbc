// Lets the library read a batch of events and publish it.

#include <vector>

#include "RAIDInstrumentation.h"
#include "agent/agent_link.h"
#include "flat/lists.h"
#include "support/input.h"
#include "support/require.h"
#include "support/served_answer.h"

using namespace raid;

int LLVMFuzzerInitialize(int* /*argc*/, char*** /*argv*/) {
    configRead = 1;
    LOG_LEVEL = 1;
    return 0;
}

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const auto answer = fuzz::inEnvelope(fuzz::textOf(data, size), "getEventsResponse");
    fuzz::serve(answer);
    setRAIDEventSequenceNumber(0);
    fuzz::require(getEvent() == 0, "getEvent returns 0");
    fuzz::require(nextSequenceNumber == getRAIDEventCount(), "the number advances by the batch");
    fuzz::require(raidEvents != nullptr || getRAIDEventCount() == 0,
                  "a malformed answer publishes no events");
    std::vector<char> buffer(answer.size() + 16);
    for (int at = 0; at < getRAIDEventCount(); ++at) {
        getRAIDEventType(buffer.data(), at);
        (void)getRAIDEventSequenceNumber(at);
    }
    return 0;
}
