#include "events/continuity.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

#include "sample.h"

namespace raidinfo {
namespace {

using test::sample;
using testing::ElementsAre;
using testing::IsEmpty;

Record event(int number, const std::string& message = "") {
    return sample(eventKind(), {{"sequence_number", number}, {"message_string", message}});
}

Records batch(const std::vector<int>& numbers) {
    Records events;
    for (const int number : numbers) {
        events.push_back(event(number));
    }
    return events;
}

std::vector<int> shownEvents(Continuity& continuity, const Records& events) {
    std::vector<int> numbers;
    for (const std::size_t place : continuity.accept(events).fresh) {
        numbers.push_back(numberOf(eventKind(), events[place], "sequence_number"));
    }
    return numbers;
}

std::vector<int> shownOf(Continuity& continuity, const std::vector<int>& numbers) {
    return shownEvents(continuity, batch(numbers));
}

TEST(Continuity, ShowsEachEventOnce) {
    Continuity continuity{41};
    EXPECT_THAT(shownOf(continuity, {41, 42}), ElementsAre(41, 42));
    EXPECT_THAT(shownOf(continuity, {41, 42}), IsEmpty());
    EXPECT_THAT(shownOf(continuity, {42, 43, 44, 44}), ElementsAre(43, 44));
    EXPECT_EQ(continuity.next(), 45);
    EXPECT_EQ(continuity.last(), 44);
}

TEST(Continuity, TakesTwoEventsOfOneNumberForTheSameHistory) {
    Continuity continuity{5};
    const Records two{event(5, "a"), event(5, "b")};
    EXPECT_THAT(shownEvents(continuity, two), ElementsAre(5, 5));
    EXPECT_EQ(continuity.compared(two), Continuity::History::same);
    EXPECT_EQ(continuity.compared({event(5, "c")}), Continuity::History::different);
    EXPECT_EQ(continuity.compared({event(5, "a"), event(5, "c")}), Continuity::History::same)
        << "one more of this number is only new";
}

TEST(Continuity, AwaitsOtherEventsWithTheNumbersOfThoseThatTheServiceHasLost) {
    Continuity continuity{1};
    static_cast<void>(continuity.accept({event(1, "a"), event(2, "b")}));
    continuity.shrinkTo(1);
    const Records again{event(1, "a"), event(2, "c")};
    EXPECT_EQ(continuity.compared(again), Continuity::History::same);
    EXPECT_THAT(shownEvents(continuity, again), ElementsAre(2));
}

TEST(Continuity, DoesNotHoldTheEventsOfTheCountBeforeAgainstThoseOfANewOne) {
    Continuity continuity{1};
    static_cast<void>(continuity.accept({event(1, "old"), event(2, "old"), event(3, "same")}));
    continuity.beginAnew();
    EXPECT_THAT(shownEvents(continuity, {event(1, "new")}), ElementsAre(1));
    const Records more{event(1, "new"), event(2, "new"), event(3, "same")};
    EXPECT_EQ(continuity.compared(more), Continuity::History::same);
    EXPECT_THAT(shownEvents(continuity, more), ElementsAre(2)) << "3 was shown as it is";
    EXPECT_EQ(continuity.compared({event(3, "other")}), Continuity::History::different)
        << "it belongs to the new count, too";
}

TEST(Continuity, BeginsAtAnyNumberAfterARunThatFoundNoEvent) {
    Continuity continuity = Continuity::after({0});
    const auto accepted = continuity.accept(batch({7, 8}));
    EXPECT_THAT(accepted.fresh, ElementsAre(0U, 1U));
    EXPECT_THAT(accepted.missing, IsEmpty());
}

TEST(Continuity, PassesOverWhatIsBeforeItsBeginning) {
    Continuity continuity{41};
    EXPECT_THAT(shownOf(continuity, {39, 40, 41}), ElementsAre(41));
}

TEST(Continuity, GoesOnAfterTheLastNumberOfAnEarlierRun) {
    Continuity continuity = Continuity::after({41});
    EXPECT_EQ(continuity.next(), 42);
    EXPECT_THAT(shownOf(continuity, {41, 42}), ElementsAre(42));
}

TEST(Continuity, TellsWhatIsMissing) {
    Continuity continuity{1};
    EXPECT_THAT(continuity.accept(batch({1, 2, 5, 7})).missing,
                ElementsAre(MissingNumbers{3, 4}, MissingNumbers{6, 6}));
    EXPECT_THAT(continuity.accept(batch({10})).missing, ElementsAre(MissingNumbers{8, 9}));
    EXPECT_THAT(continuity.accept(batch({11})).missing, IsEmpty());
}

TEST(Continuity, MissesNothingBeforeTheFirstEventWhereAnyMayBeTheFirst) {
    Continuity continuity{0};
    EXPECT_THAT(continuity.accept(batch({500, 501})).missing, IsEmpty());
    EXPECT_EQ(continuity.next(), 502);
}

TEST(Continuity, ShowsABatchByItsNumbersSoThatTheLastOneIsTheGreatest) {
    Continuity continuity{1};
    const Continuity::Accepted accepted = continuity.accept(batch({2, 3, 1}));
    EXPECT_THAT(accepted.fresh, ElementsAre(2U, 0U, 1U));
    EXPECT_THAT(accepted.missing, IsEmpty());
}

TEST(Continuity, ShowsAnotherEventWithTheSameNumber) {
    Continuity continuity{1};
    EXPECT_THAT(shownEvents(continuity, {event(1, "a"), event(1, "a"), event(1, "b")}),
                ElementsAre(1, 1));
    EXPECT_THAT(shownEvents(continuity, {event(1, "b"), event(1, "c")}), ElementsAre(1));
}

TEST(Continuity, ShowsAnEventThatComesLate) {
    Continuity continuity{1};
    EXPECT_THAT(shownOf(continuity, {1, 5}), ElementsAre(1, 5));
    EXPECT_THAT(shownOf(continuity, {3}), ElementsAre(3));
    EXPECT_THAT(shownOf(continuity, {2, 3, 4, 4, 5}), ElementsAre(2, 4));
    EXPECT_THAT(shownOf(continuity, {2, 3, 4}), IsEmpty());
}

TEST(Continuity, ComparesABatchWithWhatItShowed) {
    using History = Continuity::History;
    Continuity continuity{1};
    EXPECT_EQ(continuity.compared({event(1, "a")}), History::unknown);
    EXPECT_THAT(shownEvents(continuity, {event(1, "a"), event(2, "b")}), ElementsAre(1, 2));
    EXPECT_EQ(continuity.compared({event(2, "b"), event(3, "c")}), History::same);
    EXPECT_EQ(continuity.compared({event(3, "c")}), History::unknown);
    EXPECT_EQ(continuity.compared({event(1, "a"), event(2, "other")}), History::different);
}

TEST(Continuity, ComparesWithWhatAnEarlierRunShowed) {
    const Continuity continuity = Continuity::after({7, contentOf(event(7, "a"))});
    EXPECT_EQ(continuity.compared({event(7, "a")}), Continuity::History::same);
    EXPECT_EQ(continuity.compared({event(7, "b")}), Continuity::History::different);
}

TEST(Continuity, KnowsByTheirContentWhatItShowedBeforeTheServiceCountedAnew) {
    Continuity continuity{1};
    EXPECT_THAT(shownEvents(continuity, {event(1, "old"), event(2, "old"), event(3, "lost")}),
                ElementsAre(1, 2, 3));
    continuity.beginAnew();
    EXPECT_EQ(continuity.next(), 0);
    EXPECT_EQ(continuity.last(), std::nullopt);
    EXPECT_THAT(shownEvents(continuity, {event(1, "old"), event(2, "old"), event(3, "new")}),
                ElementsAre(3));
    EXPECT_EQ(continuity.next(), 4);
}

TEST(Continuity, ExpectsNumbersAgainThatTheServiceHasLost) {
    Continuity continuity{1};
    EXPECT_THAT(shownEvents(continuity, {event(1), event(2), event(3, "lost")}),
                ElementsAre(1, 2, 3));
    continuity.shrinkTo(2);
    EXPECT_EQ(continuity.next(), 3);
    EXPECT_THAT(shownEvents(continuity, {event(3, "new")}), ElementsAre(3));
}

TEST(Continuity, AsksForTheLastOneShownAgainAndForWhatIsMissingALittleBelow) {
    Continuity continuity{1};
    EXPECT_EQ(continuity.overlapping(), 1);
    static_cast<void>(continuity.accept(batch({1, 2})));
    EXPECT_EQ(continuity.overlapping(), 2);
    EXPECT_FALSE(continuity.waitsForLateEvents());
    static_cast<void>(continuity.accept(batch({5})));
    EXPECT_EQ(continuity.overlapping(), 3);
    EXPECT_TRUE(continuity.waitsForLateEvents());
    static_cast<void>(continuity.accept(batch({103})));
    // From further below, the library would read nothing that is ahead.
    EXPECT_EQ(continuity.overlapping(), 4);
    static_cast<void>(continuity.accept(batch({104})));
    EXPECT_EQ(continuity.overlapping(), 6);
    static_cast<void>(continuity.accept(batch({500})));
    EXPECT_EQ(continuity.overlapping(), 401);
}

TEST(Continuity, AsksNotAgainWhereThereIsNothing) {
    Continuity continuity{1};
    continuity.passOverTo(102);
    EXPECT_EQ(continuity.next(), 102);
    const Continuity::Accepted accepted = continuity.accept(batch({500}));
    EXPECT_THAT(accepted.missing, ElementsAre(MissingNumbers{1, 499}));
    EXPECT_EQ(continuity.next(), 501);
}

TEST(Continuity, AsksAgainBelowWhatItPassedOverOnceTheServiceHasNoneThatFar) {
    Continuity continuity{1};
    continuity.passOverTo(5'000);
    continuity.heedNewest(6'000);
    EXPECT_EQ(continuity.next(), 5'000);
    continuity.heedNewest(8);
    EXPECT_EQ(continuity.next(), 1);
}

TEST(Continuity, CountsBeyondTheLargestNumber) {
    Continuity continuity{2147483647};
    EXPECT_THAT(shownOf(continuity, {2147483647}), ElementsAre(2147483647));
    EXPECT_EQ(continuity.next(), 2147483648);
    EXPECT_THAT(shownOf(continuity, {2147483647}), IsEmpty());
}

}  // namespace
}  // namespace raidinfo
