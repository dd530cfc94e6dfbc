#include "state/event_log.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace raidsim {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;

void appendMany(EventLog& log, int count) {
    for (int i = 0; i < count; ++i)
        log.append({});
}

std::vector<int> numbersIn(const std::string& body) {
    constexpr std::string_view tag = "<as:sequenceNumber xsi:type=\"xsd:int\">";
    std::vector<int> numbers;
    for (auto at = body.find(tag); at != std::string::npos; at = body.find(tag, at + 1))
        numbers.push_back(std::stoi(body.substr(at + tag.size())));
    return numbers;
}

TEST(EventLog, NumbersEventsFromOne) {
    EventLog log;
    EXPECT_EQ(log.newest(), 0);
    EXPECT_EQ(log.append({}), 1);
    EXPECT_EQ(log.append({}), 2);
    EXPECT_EQ(log.newest(), 2);
}

TEST(EventLog, RangeIsInclusiveAtBothEnds) {
    EventLog log;
    appendMany(log, 6);
    EXPECT_THAT(numbersIn(log.body(2, 4)), ElementsAre(2, 3, 4));
    EXPECT_THAT(numbersIn(log.body(0, 100)), ElementsAre(1, 2, 3, 4, 5, 6));
    EXPECT_THAT(numbersIn(log.body(-5, 1)), ElementsAre(1));
    EXPECT_THAT(numbersIn(log.body(7, 107)), ElementsAre());
    EXPECT_THAT(numbersIn(log.body(4, 2)), ElementsAre());
}

TEST(EventLog, WritesFieldsInTheVocabularysOrderAndTheLastValueOfEach) {
    EventLog log;
    log.append({{"fru", "F"}, {"adapter", "9"}, {"string", "a & b"}, {"adapter", "1"}});
    EXPECT_THAT(
        log.body(1, 1),
        HasSubstr("        <ac:event xsi:type=\"o:Event\">\n"
                  "          <as:sequenceNumber xsi:type=\"xsd:int\">1</as:sequenceNumber>\n"
                  "          <as:string xsi:type=\"xsd:string\">a &amp; b</as:string>\n"
                  "          <as:adapter xsi:type=\"xsd:int\">1</as:adapter>\n"
                  "          <as:fru xsi:type=\"xsd:string\">F</as:fru>\n"
                  "        </ac:event>\n"));
}

TEST(EventLog, GivenSequenceNumberMustRise) {
    EventLog log;
    EXPECT_EQ(log.append({{"sequenceNumber", "40"}}), 40);
    EXPECT_EQ(log.append({}), 41);
    EXPECT_THROW(log.append({{"sequenceNumber", "41"}}), EventError);
    EXPECT_EQ(log.newest(), 41);
    EXPECT_THAT(numbersIn(log.body(0, 100)), ElementsAre(40, 41));
}

TEST(EventLog, EndsAtTheLargestNumber) {
    EventLog log;
    log.append({{"sequenceNumber", "2147483647"}});
    EXPECT_THROW(log.append({}), EventError);
    EXPECT_THAT(numbersIn(log.body(0, 2147483647)), ElementsAre(2147483647));
}

TEST(EventLog, RefusesUnknownFieldsAndWordsForNumbers) {
    EventLog log;
    EXPECT_THROW(log.append({{"color", "red"}}), EventError);
    EXPECT_THROW(log.append({{"channel", "one"}}), EventError);
    EXPECT_EQ(log.size(), 0U);
}

TEST(EventLog, OldestEventGivesWayWhenFull) {
    EventLog log(3);
    appendMany(log, 5);
    EXPECT_EQ(log.size(), 3U);
    EXPECT_THAT(numbersIn(log.body(0, 100)), ElementsAre(3, 4, 5));
}

TEST(EventLog, WaitForAnEventThatIsThereEndsAtOnceWithTheFirstNewer) {
    EventLog log;
    appendMany(log, 3);
    int got = 0;
    log.await(1, [&](int number) { got = number; });
    EXPECT_EQ(got, 2);
    EXPECT_EQ(log.waiting(), 0U);
}

TEST(EventLog, WaitEndsWithTheFirstEventAboveTheLastRetrieved) {
    EventLog log;
    int got = 0;
    log.await(2, [&](int number) { got = number; });
    appendMany(log, 2);
    EXPECT_EQ(got, 0);
    EXPECT_EQ(log.waiting(), 1U);
    log.append({});
    EXPECT_EQ(got, 3);
    EXPECT_EQ(log.waiting(), 0U);
}

TEST(EventLog, CancelledWaitIsForgotten) {
    EventLog log;
    bool called = false;
    const auto ticket = log.await(0, [&](int) { called = true; });
    log.cancel(ticket);
    EXPECT_EQ(log.waiting(), 0U);
    log.append({});
    EXPECT_FALSE(called);
}

TEST(EventLog, WaiterMayWaitAgain) {
    EventLog log;
    std::vector<int> got;
    log.await(0, [&](int first) {
        got.push_back(first);
        log.await(first, [&](int second) { got.push_back(second); });
    });
    appendMany(log, 3);
    EXPECT_THAT(got, ElementsAre(1, 2));
}

}  // namespace
}  // namespace raidsim
