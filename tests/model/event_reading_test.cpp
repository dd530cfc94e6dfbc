// Reading "ac:events" and "ac:event".

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "model/raid_events.h"
#include "support/elements.h"
#include "support/files.h"
#include "support/fresh_library.h"
#include "support/reading.h"

namespace {

using namespace raid::test;

std::string missing(const std::string& what, const std::string& found) {
    return "XML syntax error: End of \"" + what + "\" is missing before : " + found +
           "\nassociation:\n";
}

class EventReading : public FreshLibrary {};

TEST_F(EventReading, YieldsAnEmptyBatchOfAnEmptyElement) {
    for (const char* const empty : {"<ac:events></ac:events>", "<ac:events/>"}) {
        EXPECT_TRUE(read<RAIDEvents>(empty).getEvents().empty());
    }
    EXPECT_TRUE(RAIDEvents().getEvents().empty());
}

TEST_F(EventReading, KeepsTheOrderOfTheDocument) {
    std::string events;
    for (const int number : {5, 3, 9, 3}) {
        events += element("ac:event", element("as:sequenceNumber", number));
    }
    std::vector<int> read4;
    for (const auto& event : read<RAIDEvents>(element("ac:events", events)).getEvents()) {
        read4.push_back(event.getSequenceNumber());
    }
    EXPECT_EQ(read4, (std::vector<int>{5, 3, 9, 3}));
}

TEST_F(EventReading, KeepsADateAsItWasSent) {
    for (const char* const date : {"2003-02-30T25:61:00+99:00", "yesterday", "12  May &amp; so"}) {
        EXPECT_EQ(read<RAIDEvent>(element("ac:event", element("as:date", date))).getDate(), date);
    }
}

TEST_F(EventReading, TakesTheTypesFromTheAttributes) {
    const auto events =
        read<RAIDEvents>(element("ac:events", element("ac:event", "", "o:Event"), "o:Events"));
    EXPECT_EQ(events.getEventsType(), "o:Events");
    EXPECT_EQ(events.getEvents().at(0).getEventType(), "o:Event");
    EXPECT_EQ(read<RAIDEvents>("<ac:events/>").getEventsType(), "");
    EXPECT_EQ(read<RAIDEvents>("<ac:events xsi:type='a' xsi:type='b' x='c'/>").getEventsType(),
              "b");
}

TEST_F(EventReading, HandsOutCopies) {
    const auto events = read<RAIDEvents>("<ac:events><ac:event/></ac:events>");
    auto copy = events.getEvents();
    copy.clear();
    EXPECT_EQ(events.getEvents().size(), 1U);
}

TEST_F(EventReading, ReportsWhatDoesNotBelongIntoABatch) {
    EXPECT_EQ(errorOf<RAIDEvents>("<ac:events></ac:event></ac:events>"),
              missing("Events", "ac:event"));
    EXPECT_EQ(errorOf<RAIDEvents>("<ac:events><ac:events>"), missing("name", "ac:events"));
    EXPECT_EQ(errorOf<RAIDEvents>("<ac:events>"), missing("Events", ""));
    EXPECT_EQ(errorOf<RAIDEvents>("<ac:events><as:date>"),
              "XML syntax error: Unknown element in   : as:date\nassociation:\n");
    EXPECT_EQ(errorOf<RAIDEvents>("<ac:events><ac:event><x>"),
              "XML syntax error: Unknown element in   : x\nassociation:\n\nassociation:\n");
}

TEST_F(EventReading, ReportsWhatDoesNotBelongIntoAnEvent) {
    EXPECT_EQ(errorOf<RAIDEvent>("<ac:event><ac:event>"), missing("name", "ac:event"));
    EXPECT_EQ(errorOf<RAIDEvent>("<ac:event>"), missing("Event", ""));
    for (const char* const unknown : {"as:Date", "ac:events"}) {
        EXPECT_EQ(errorOf<RAIDEvent>("<ac:event>" + element(unknown, "1") + "</ac:event>"),
                  "XML syntax error: Unknown element in   : " + std::string(unknown) +
                      "\nassociation:\n");
    }
    EXPECT_EQ(errorOf<RAIDEvent>("<ac:event>some text</ac:event>"),
              "XML syntax error: Unknown element in   : some text\nassociation:\n");
}

TEST_F(EventReading, LogsNoExitOfAMalformedElement) {
    writeLogLevel(9);
    const auto lines = [](const std::string& document) {
        errorOf<RAIDEvents>(document);
        const auto log = readLog();
        std::filesystem::remove(logPath);
        return log;
    };
    EXPECT_NE(lines("<ac:events/>").find("Exit RAIDEvents Constructor\n"), std::string::npos);
    const auto failed = lines("<ac:events><ac:event></as:fru>");
    EXPECT_NE(failed.find("RAIDEvent Constructor\n"), std::string::npos);
    EXPECT_EQ(failed.find("Exit"), std::string::npos);
}

}  // namespace
