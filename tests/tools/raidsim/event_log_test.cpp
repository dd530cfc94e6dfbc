#include "state/event_log.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <optional>
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

TEST(EventLog, NumbersBelowOneAreTakenAtAPlaceOnly) {
    EventLog log;
    log.insert({{"sequenceNumber", "-9"}}, {});
    EXPECT_THROW(log.append({{"sequenceNumber", "-4"}}), EventError);
    log.insert({{"sequenceNumber", "-4"}}, {});
    EXPECT_EQ(log.append({{"sequenceNumber", "1"}}), 1);
    EXPECT_THAT(numbersIn(log.body(-100, 100)), ElementsAre(-9, -4, 1));
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

TEST(EventLog, KeepsWhatWasAddedLastWhereverItIsListed) {
    EventLog log(3);
    appendMany(log, 3);
    log.insert({{"sequenceNumber", "20"}}, {EventPlace::Kind::first});
    EXPECT_THAT(numbersIn(log.body(0, 100)), ElementsAre(20, 2, 3));
    log.append({});
    EXPECT_THAT(numbersIn(log.body(0, 100)), ElementsAre(20, 3, 21));
}

TEST(EventLog, WaitForAnEventThatIsThereEndsAtOnceWithTheFirstNewer) {
    EventLog log;
    appendMany(log, 3);
    int got = 0;
    log.await(1, [&](std::optional<int> number) { got = number.value_or(-1); });
    EXPECT_EQ(got, 2);
    EXPECT_EQ(log.waiting(), 0U);
}

TEST(EventLog, WaitEndsWithTheFirstEventAboveTheLastRetrieved) {
    EventLog log;
    int got = 0;
    log.await(2, [&](std::optional<int> number) { got = number.value_or(-1); });
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
    const auto ticket = log.await(0, [&](std::optional<int>) { called = true; });
    log.cancel(ticket);
    EXPECT_EQ(log.waiting(), 0U);
    log.append({});
    EXPECT_FALSE(called);
}

TEST(EventLog, WaiterMayWaitAgain) {
    EventLog log;
    std::vector<int> got;
    log.await(0, [&](std::optional<int> first) {
        got.push_back(first.value());
        log.await(*first, [&](std::optional<int> second) { got.push_back(second.value()); });
    });
    appendMany(log, 3);
    EXPECT_THAT(got, ElementsAre(1, 2));
}

TEST(EventLog, LastWaitersAreGivenUpOrWokenAsIfTheNextOneWereThere) {
    EventLog log;
    std::vector<std::optional<int>> got;
    const auto note = [&](std::optional<int> number) { got.push_back(number); };
    log.await(4, note);
    log.await(2147483647, note);
    log.wakeWaiters();
    EXPECT_THAT(got, ElementsAre(5, 2147483647));
    log.await(4, note);
    log.giveWaitersUp();
    EXPECT_EQ(got.back(), std::nullopt);
    EXPECT_EQ(log.waiting(), 0U);
}

// The numbers that a service gets wrong.
class MisnumberedLog : public testing::Test {
protected:
    void insert(int number, EventPlace::Kind kind = EventPlace::Kind::last, int neighbour = 0) {
        log.insert({{"sequenceNumber", std::to_string(number)}}, {kind, neighbour});
    }
    [[nodiscard]] std::vector<int> numbers() const { return numbersIn(log.body(-100, 100)); }

    EventLog log;
};

TEST_F(MisnumberedLog, ListsEventsAsTheyWereTold) {
    for (const int number : {5, 5, 9, 7, -1})
        insert(number);
    EXPECT_THAT(numbers(), ElementsAre(5, 5, 9, 7, -1));
    EXPECT_THAT(numbersIn(log.body(5, 7)), ElementsAre(5, 5, 7));
}

TEST_F(MisnumberedLog, ListsEventsWhereTheyWereTold) {
    insert(5);
    insert(6);
    insert(1, EventPlace::Kind::first);
    insert(2, EventPlace::Kind::before, 6);
    insert(3, EventPlace::Kind::after, 6);
    insert(4, EventPlace::Kind::after, 5);
    EXPECT_THAT(numbers(), ElementsAre(1, 5, 4, 2, 6, 3));
    EXPECT_THROW(insert(7, EventPlace::Kind::before, 99), EventError);
    EXPECT_THROW(insert(7, EventPlace::Kind::after, 99), EventError);
    EXPECT_EQ(log.size(), 6U);
}

TEST_F(MisnumberedLog, CountsOnFromTheOneAtTheEnd) {
    insert(40);
    insert(2);
    EXPECT_EQ(log.newest(), 2);
    EXPECT_EQ(log.append({}), 3);
}

TEST_F(MisnumberedLog, CountsOnFromAHigherOneElsewhere) {
    insert(5);
    insert(3, EventPlace::Kind::first);
    EXPECT_EQ(log.newest(), 5);
    insert(8, EventPlace::Kind::first);
    EXPECT_EQ(log.append({}), 9);
}

TEST_F(MisnumberedLog, TakesTheNextNumberWhereNoneIsGiven) {
    insert(5);
    EXPECT_EQ(log.insert({}, {EventPlace::Kind::first, 0}), 6);
}

TEST_F(MisnumberedLog, WaitEndsWithTheFirstListedNumberAbove) {
    insert(40);
    insert(3);
    std::vector<int> got;
    const auto note = [&](std::optional<int> number) { got.push_back(number.value()); };
    log.await(2, note);
    log.await(40, note);
    insert(7);
    insert(41);
    EXPECT_THAT(got, ElementsAre(40, 41));
}

TEST_F(MisnumberedLog, RollsBack) {
    for (const int number : {1, 2, 9, 3})
        insert(number);
    log.rollBack(2);
    EXPECT_THAT(numbers(), ElementsAre(1, 2));
    EXPECT_EQ(log.append({}), 3);
    log.clear();
    EXPECT_THAT(numbers(), ElementsAre());
    EXPECT_EQ(log.append({}), 1);
}

TEST_F(MisnumberedLog, WaitsGoOnWhenTheLogIsForgotten) {
    insert(1);
    std::optional<int> got;
    log.await(1, [&](std::optional<int> number) { got = number; });
    log.clear();
    log.append({});
    EXPECT_EQ(got, std::nullopt);
    log.append({});
    EXPECT_EQ(got, 2);
}

}  // namespace
}  // namespace raidsim
