// The event stream as its client sees it.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "RAIDInstrumentation.h"
#include "support/blocked_call.h"
#include "support/elements.h"
#include "support/fresh_library.h"
#include "support/open_descriptors.h"
#include "support/scripted_service.h"

namespace {

using namespace raid::test;

Connection batch(int first, int count) {
    std::string events;
    for (int number = first; number < first + count; ++number) {
        events += element("ac:event", element("as:sequenceNumber", number));
    }
    return answering(eventsDocument(element("ac:events", events)));
}

// Every wait is answered alike.
Connection waited() { return answering("<any/>"); }

// The sequence numbers of the published events.
std::vector<int> published() {
    std::vector<int> numbers;
    for (int at = 0; at < getRAIDEventCount(); ++at) {
        numbers.push_back(getRAIDEventSequenceNumber(at));
    }
    return numbers;
}

using Numbers = std::vector<int>;

bool asks(const std::string& request, const std::string& argument, int value) {
    return request.find("<as:" + argument + " xsi:type=\"xsd:int\">" + std::to_string(value) +
                        "</as:" + argument + ">") != std::string::npos;
}

class EventCalls : public FreshLibrary {};

TEST_F(EventCalls, CountNoEventsBeforeTheFirstBatch) {
    EXPECT_EQ(getRAIDEventCount(), 0);
    EXPECT_EQ(nextSequenceNumber, 0);
}

TEST_F(EventCalls, AdvanceByTheSizeOfABatch) {
    const ScriptedService service({waited(), batch(0, 3), waited(), batch(3, 2)});
    EXPECT_EQ(getEvent(), 0);
    EXPECT_EQ(published(), (Numbers{0, 1, 2}));
    EXPECT_EQ(nextSequenceNumber, 3);
    EXPECT_EQ(getEvent(), 0);
    EXPECT_EQ(published(), (Numbers{3, 4}));
    EXPECT_EQ(nextSequenceNumber, 5);
    EXPECT_TRUE(asks(service.request(0), "lastRetrieved", 0));
    EXPECT_TRUE(asks(service.request(3), "start", 3));
}

TEST_F(EventCalls, StayWhereTheyAreAfterAnEmptyBatch) {
    setRAIDEventSequenceNumber(7);
    const ScriptedService service({waited(), batch(7, 2), waited(), batch(9, 0)});
    getEvent();
    getEvent();
    EXPECT_EQ(getRAIDEventCount(), 0);
    EXPECT_EQ(nextSequenceNumber, 9);
}

TEST_F(EventCalls, ResumeFromANumberThatIsSet) {
    setRAIDEventSequenceNumber(40);
    EXPECT_EQ(nextSequenceNumber, 40);
    const ScriptedService service({waited(), batch(40, 1)});
    getEvent();
    EXPECT_TRUE(asks(service.request(0), "lastRetrieved", 39));
    EXPECT_TRUE(asks(service.request(1), "start", 40));
    EXPECT_TRUE(asks(service.request(1), "end", 140));
    EXPECT_EQ(nextSequenceNumber, 41);
}

TEST_F(EventCalls, StartAtTheNewestEvent) {
    const ScriptedService service({answering(newestEventDocument("17")), waited(), batch(17, 1)});
    EXPECT_EQ(enableRAIDEvent(), 1);
    EXPECT_EQ(nextSequenceNumber, 17);
    getEvent();
    EXPECT_TRUE(asks(service.request(1), "lastRetrieved", 16));
    EXPECT_TRUE(asks(service.request(2), "start", 17));
    EXPECT_EQ(published(), (Numbers{17}));
}

TEST_F(EventCalls, TellThatTheNewestEventIsUnknown) {
    EXPECT_EQ(enableRAIDEvent(), 0);
    EXPECT_EQ(nextSequenceNumber, -1);
    const ScriptedService service({waited(), batch(5, 1)});
    getEvent();
    EXPECT_TRUE(asks(service.request(0), "lastRetrieved", -2));
    EXPECT_TRUE(asks(service.request(1), "start", -1));
}

TEST_F(EventCalls, TakeTheNumberMinusOneForUnknown) {
    const ScriptedService service(
        {answering(newestEventDocument("-1")), answering(newestEventDocument("none"))});
    EXPECT_EQ(enableRAIDEvent(), 0);
    EXPECT_EQ(enableRAIDEvent(), 1);
    EXPECT_EQ(nextSequenceNumber, 0);
}

TEST_F(EventCalls, PublishThePreviousBatchAgainWhenTheyAreCancelled) {
    expectOpenDescriptors(1);
    const ScriptedService service({waited(), batch(0, 2), {.end = End::hold}});
    getEvent();
    EXPECT_EQ(nextSequenceNumber, 2);
    BlockedCall blocked(getEvent);
    service.waitFor(2, Stage::requestRead);
    cancelGetEvent();
    EXPECT_EQ(blocked.interrupt(), 0);
    EXPECT_EQ(published(), (Numbers{0, 1}));
    EXPECT_EQ(nextSequenceNumber, 4);
}

TEST_F(EventCalls, PublishThePreviousBatchAgainWhenTheServiceIsGone) {
    {
        const ScriptedService service({waited(), batch(0, 2)});
        getEvent();
    }
    EXPECT_EQ(getEvent(), 0);
    EXPECT_EQ(published(), (Numbers{0, 1}));
    EXPECT_EQ(nextSequenceNumber, 4);
}

TEST_F(EventCalls, PublishNothingWithoutAnyBatch) {
    setRAIDEventSequenceNumber(12);
    EXPECT_EQ(getEvent(), 0);
    EXPECT_EQ(getRAIDEventCount(), 0);
    EXPECT_EQ(nextSequenceNumber, 12);
}

TEST_F(EventCalls, PublishNothingAfterAMalformedAnswer) {
    const ScriptedService service(
        {waited(), batch(0, 2), waited(), answering(eventsDocument("<ac:events><oops>"))});
    getEvent();
    EXPECT_EQ(getEvent(), 0);
    EXPECT_EQ(getRAIDEventCount(), 0);
    EXPECT_EQ(nextSequenceNumber, 2);
}

TEST_F(EventCalls, CountWithoutAskingTheService) {
    // A service that is asked without a script fails the test.
    const ScriptedService service({});
    setRefreshFlag();
    EXPECT_EQ(getRAIDEventCount(), 0);
    EXPECT_EQ(refresh, 1);
}

}  // namespace
