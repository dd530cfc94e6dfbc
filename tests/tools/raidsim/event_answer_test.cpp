#include "state/event_answer.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

#include "state/event_log.h"

namespace raidsim {
namespace {

// As nobody here would write it: other indentation, comments, attributes, an empty line.
std::string foreign(const std::string& events) {
    return "<?xml version='1.0'?><e:Envelope xmlns:e='x'>\r\n<e:Body><m:getEventsResponse>\n"
           "<ac:events a=\">\">" +
           events + "\n</ac:events ></m:getEventsResponse></e:Body></e:Envelope>  <!-- end -->";
}

std::string event(int number, const std::string& more = "") {
    return "<ac:event xsi:type='o:Event'><as:sequenceNumber> " + std::to_string(number) +
           "\n</as:sequenceNumber>" + more + "</ac:event>";
}

EventAnswer cut(const std::string& body) { return cutEventAnswer(body).value(); }

TEST(EventAnswer, IsCutWithoutLosingAByte) {
    const std::string body = foreign("  <!-- first -->\n\t" + event(7) + "\n\n  <?x y?>" +
                                     event(5, "<as:fru/>") + event(5));
    const EventAnswer answer = cut(body);
    std::string joined = answer.frame.head;
    for (const ListedEvent& listed : answer.events)
        joined += listed.gap + listed.bytes;
    EXPECT_EQ(joined + answer.frame.tail, body);
    ASSERT_EQ(answer.events.size(), 3U);
    EXPECT_EQ(answer.events[0].sequenceNumber, 7);
    EXPECT_EQ(answer.events[0].gap, "\n\t");
    EXPECT_EQ(answer.events[1].bytes, event(5, "<as:fru/>"));
}

TEST(EventAnswer, WithoutEventsIsEmpty) {
    for (const std::string& body : {foreign(""), std::string("<x><ac:events/></x>")}) {
        const EventAnswer answer = cut(body);
        EXPECT_TRUE(answer.events.empty());
        EXPECT_EQ(answer.frame.empty, body);
    }
}

TEST(EventAnswer, IsNoneWhereClientsCouldNotReadIt) {
    for (const std::string& body :
         {std::string(), std::string("<x"), std::string("<x/>"), foreign("") + foreign(""),
          foreign("<ac:event></ac:event>"), foreign("<ac:event>") + "</ac:event>",
          foreign("<ac:event><as:sequenceNumber>five</as:sequenceNumber></ac:event>"),
          std::string("<x><ac:events/><ac:events/></x>")})
        EXPECT_FALSE(cutEventAnswer(body).has_value()) << body;
}

TEST(EventAnswer, OfTheServiceItselfIsCutLikeAnyOther) {
    EventLog own;
    own.append({{"string", "a & b"}});
    own.append({});
    const EventAnswer answer = cut(own.body(1, 2));
    EXPECT_EQ(answer.frame.head, ownEventFrame().head);
    EXPECT_EQ(answer.frame.tail, ownEventFrame().tail);
    EXPECT_EQ(answer.events[1].gap, ownEventGap);
}

TEST(EventLog, ServesWhatItTookByteForByte) {
    const std::string first = foreign("\n" + event(7) + "\n  " + event(9));
    const std::string second = foreign("\t" + event(10));
    EventLog log;
    EXPECT_TRUE(log.take(cut(first)));
    EXPECT_EQ(log.newest(), 9);
    EXPECT_EQ(log.body(7, 107), first);
    EXPECT_TRUE(log.take(cut(second)));
    EXPECT_EQ(log.body(7, 9), first);
    EXPECT_EQ(log.body(10, 110), second);
    EXPECT_EQ(log.body(11, 111), foreign(""));
    EXPECT_EQ(log.body(9, 10), foreign("\n  " + event(9) + "\t" + event(10)));
}

TEST(EventLog, TakesWhatItHoldsOnlyOnce) {
    EventLog log;
    log.take(cut(foreign(event(7) + event(8))));
    EXPECT_FALSE(log.take(cut(foreign(event(8)))));
    EXPECT_TRUE(log.take(cut(foreign(event(8) + event(9)))));
    EXPECT_EQ(log.body(0, 100), foreign(event(7) + event(8) + event(9)));
}

TEST(EventLog, TakesAnotherEventOfTheSameNumberInPlaceOfTheOld) {
    EventLog log;
    log.take(cut(foreign(event(7) + event(8))));
    EXPECT_TRUE(log.take(cut(foreign(event(7, "<as:fru>F</as:fru>")))));
    EXPECT_EQ(log.body(0, 100), foreign(event(8) + event(7, "<as:fru>F</as:fru>")));
    EXPECT_EQ(log.newest(), 7);
}

TEST(EventLog, TakesTheDisorderOfAnAnswer) {
    const std::string body = foreign(event(7) + event(5) + event(5) + event(6));
    EventLog log;
    log.take(cut(body));
    EXPECT_EQ(log.body(0, 100), body);
    EXPECT_EQ(log.newest(), 6);
}

}  // namespace
}  // namespace raidsim
