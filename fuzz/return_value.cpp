// Lets the library read the number that a method of the service returns, and compares it with what
// the literal state machine and the C library make of the same answer.

#include <array>
#include <climits>
#include <cstdlib>
#include <string_view>

#include "RAIDInstrumentation.h"
#include "support/input.h"
#include "support/require.h"
#include "support/served_answer.h"
#include "support/state_machine.h"

namespace {

using namespace raid;

/// What strtol makes of the text, clamped to an int.
int numberIn(const std::string& text) {
    const long long number = std::strtoll(text.c_str(), nullptr, 10);
    if (number > INT_MAX) {
        return INT_MAX;
    }
    return number < INT_MIN ? INT_MIN : static_cast<int>(number);
}

/// The number stands in the third unit of the body: response, return element, text.
int expectedOf(std::string_view answer) {
    answer = answer.substr(0, answer.find('\0'));
    const auto next = [&answer] {
        auto unit = fuzz::describedUnit(answer);
        answer.remove_prefix(static_cast<std::size_t>(unit.consumed));
        return unit.name;
    };
    for (const auto* const name : {"?xml", "env:Envelope", "env:Body"}) {
        if (next() != name) {
            return 0;
        }
    }
    next();
    next();
    return numberIn(next());
}

}  // namespace

int LLVMFuzzerInitialize(int* /*argc*/, char*** /*argv*/) {
    configRead = 1;
    return 0;
}

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const auto answer = fuzz::inEnvelope(fuzz::textOf(data, size), "getNewestEventResponse");
    fuzz::serve(answer);
    const int enabled = enableRAIDEvent();
    fuzz::require(nextSequenceNumber == expectedOf(answer), "the number of the newest event");
    fuzz::require(enabled == (nextSequenceNumber != -1 ? 1 : 0), "whether events are enabled");
    return 0;
}
