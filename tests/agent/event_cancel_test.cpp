// Cancelling the wait for events.

#include <gtest/gtest.h>

#include <atomic>
#include <string>

#include "agent_documents.h"
#include "support/blocked_call.h"
#include "support/files.h"
#include "support/fresh_library.h"
#include "support/open_descriptors.h"
#include "support/scripted_service.h"

namespace {

using namespace raid::test;

class EventCancel : public FreshLibrary {
protected:
    EventCancel() { process(processEventXML, eventsNumbered(1, 3)); }
};

TEST_F(EventCancel, SetsBothFlags) {
    cancelEventRAIDXML();
    EXPECT_EQ(cancelEvent, 1);
    EXPECT_EQ(endFlag, 1);
}

TEST_F(EventCancel, DuringTheWaitSendsNoFurtherRequest) {
    expectOpenDescriptors(1);
    configRead = 0;
    writeLogLevel(8);
    const ScriptedService service({{.end = End::hold}});
    BlockedCall blocked([] { return getEventRAIDXML(4); });
    service.waitFor(0, Stage::requestRead);
    cancelEventRAIDXML();
    EXPECT_EQ(blocked.interrupt(), 0);
    EXPECT_EQ(currentEvents(), 3);
    EXPECT_TRUE(readLog().ends_with("Waiting for data\n(null)getEventRAIDXML after wait\n"));
}

// Marks the wait as cancelled and leaves the exchange alone: its answer still comes.
void markCancelled() { std::atomic_ref(cancelEvent).store(1); }

TEST_F(EventCancel, AfterTheWaitHasItsAnswerSendsNoFurtherRequest) {
    Gate gate;
    const ScriptedService service({{.pieces = {{answer("<any/>"), &gate}}}});
    BlockedCall blocked([] { return getEventRAIDXML(4); });
    service.waitFor(0, Stage::requestRead);
    markCancelled();
    gate.open();
    EXPECT_EQ(blocked.wait(), 0);
    EXPECT_EQ(currentEvents(), 3);
}

TEST_F(EventCancel, WhileTheEventsAreReadDropsThem) {
    Gate gate;
    const ScriptedService service(
        {answering("<any/>"), {.pieces = {{answer(eventsNumbered(4, 1)), &gate}}}});
    BlockedCall blocked([] { return getEventRAIDXML(4); });
    service.waitFor(1, Stage::requestRead);
    markCancelled();
    gate.open();
    EXPECT_EQ(blocked.wait(), 0);
    EXPECT_EQ(currentEvents(), 3);
}

TEST_F(EventCancel, OfAnEarlierWaitIsForgotten) {
    cancelEventRAIDXML();
    const ScriptedService service({answering("<any/>"), answering(eventsNumbered(4, 1))});
    getEventRAIDXML(4);
    EXPECT_EQ(cancelEvent, 0);
    EXPECT_EQ(currentEvents(), 1);
}

}  // namespace
