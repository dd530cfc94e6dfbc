// The wait for a connection and for an answer, and the end of both.

#include <gtest/gtest.h>

#include <chrono>

#include "exchanged.h"
#include "support/blocked_call.h"
#include "support/busy_service.h"
#include "support/fresh_library.h"
#include "support/open_descriptors.h"
#include "support/scripted_service.h"

namespace {

using namespace raid::test;

class ExchangeWait : public FreshLibrary {};

TEST_F(ExchangeWait, EndsWithNullWhenItIsCancelledAndLeavesTheSocketOpen) {
    expectOpenDescriptors(1);
    const ScriptedService service({{.end = End::hold}});
    BlockedCall blocked([] { return exchanged(); });
    service.waitFor(0, Stage::requestRead);
    disconnectSocket();
    EXPECT_EQ(blocked.interrupt(), std::nullopt);
}

TEST_F(ExchangeWait, NoticesACancelAfterItsSliceOfFiveSeconds) {
    using Clock = std::chrono::steady_clock;
    expectOpenDescriptors(1);
    const ScriptedService service({{.end = End::hold}});
    BlockedCall blocked([] { return exchanged(); });
    service.waitFor(0, Stage::requestRead);
    const auto cancelled = Clock::now();
    disconnectSocket();
    EXPECT_EQ(blocked.wait(), std::nullopt);
    // Far less than a second slice would take, and more than a busy machine adds.
    EXPECT_LT(Clock::now() - cancelled, std::chrono::seconds(9));
}

TEST_F(ExchangeWait, GoesOnAfterASignalUnlessItIsCancelled) {
    Gate gate;
    const ScriptedService service({{.pieces = {{answer("body"), &gate}}}});
    BlockedCall blocked([] { return exchanged(); });
    service.waitFor(0, Stage::requestRead);
    gate.open();
    EXPECT_EQ(blocked.interrupt(), "body");
}

// The exchange forgets a cancel that comes before it begins: it is repeated, as hosts must.
TEST_F(ExchangeWait, ForAConnectionThatNobodyAcceptsEndsWhenItIsCancelled) {
    const BusyService service;
    expectOpenDescriptors(0);
    BlockedCall blocked([] { return exchanged(); });
    while (!blocked.returnsWithin(std::chrono::milliseconds{2})) {
        disconnectSocket();
        blocked.nudge();
    }
    EXPECT_EQ(blocked.wait(), std::nullopt);
}

TEST_F(ExchangeWait, ForAConnectionNoticesACancelAfterItsSlice) {
    const BusyService service;
    BlockedCall blocked([] { return exchanged(); });
    while (!blocked.returnsWithin(std::chrono::milliseconds{100})) {
        disconnectSocket();
    }
    EXPECT_EQ(blocked.wait(), std::nullopt);
}

TEST_F(ExchangeWait, ForgetsACancelOfAnEarlierExchange) {
    disconnectSocket();
    EXPECT_EQ(endFlag, 1);
    const ScriptedService service({answering("body")});
    EXPECT_EQ(exchanged(), "body");
    EXPECT_EQ(endFlag, 0);
}

TEST_F(ExchangeWait, ForgetsACancelAlsoWhenNoServiceListens) {
    disconnectSocket();
    EXPECT_EQ(exchanged(), std::nullopt);
    EXPECT_EQ(endFlag, 0);
}

}  // namespace
