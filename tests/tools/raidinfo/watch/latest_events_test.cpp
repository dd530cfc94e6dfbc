#include "watch/latest_events.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "sample.h"

namespace raidinfo {
namespace {

using test::sample;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

Records batch(const std::vector<int>& numbers) {
    Records events;
    for (const int number : numbers) {
        events.push_back(sample(eventKind(), {{"sequence_number", number},
                                              {"message_string", std::to_string(number) + "!"}}));
    }
    return events;
}

TEST(LatestEvents, AreAwaitedBehindTheNewestAtFirst) {
    EXPECT_EQ(LatestEvents{}.awaited(0), 1);
    EXPECT_EQ(LatestEvents{}.awaited(41), 42);
}

TEST(LatestEvents, AreAwaitedFromTheFirstThatWasNotSeen) {
    LatestEvents events;
    events.take(batch({42}), 41);
    EXPECT_EQ(events.awaited(42), 43);
    EXPECT_EQ(events.awaited(45), 43) << "43 came while the inventory was read";
}

TEST(LatestEvents, AreAwaitedSoThatTheNewestIsAmongTheNumbersThatTheLibraryReads) {
    LatestEvents events;
    events.take(batch({42}), 41);
    EXPECT_EQ(events.awaited(143), 43);
    EXPECT_EQ(events.awaited(1'000'000), 999'900);
}

TEST(LatestEvents, AreAwaitedFromTheNewestOnWhereTheNumbersWentBack) {
    LatestEvents events;
    events.take(batch({42}), 41);
    EXPECT_EQ(events.awaited(7), 7);
    EXPECT_EQ(events.awaited(0), 1);
    EXPECT_TRUE(events.take(batch({7}), 7));
    EXPECT_EQ(events.awaited(7), 8);
}

TEST(LatestEvents, AreReadWithTheOneRightBeforeThem) {
    LatestEvents events;
    EXPECT_EQ(events.readFrom(42), 42);
    events.take(batch({42}), 41);
    EXPECT_EQ(events.readFrom(43), 42);
    EXPECT_EQ(events.readFrom(1'000), 1'000);
}

TEST(LatestEvents, AreTheLastThreeThatAreNew) {
    LatestEvents events;
    EXPECT_FALSE(events.take(batch({}), 41));
    EXPECT_THAT(events.lines(), IsEmpty());
    EXPECT_TRUE(events.take(batch({42, 43, 44}), 41));
    EXPECT_FALSE(events.take(batch({44}), 44)) << "published again";
    EXPECT_TRUE(events.take(batch({44, 45}), 44));
    EXPECT_THAT(events.lines(), ElementsAre(HasSubstr("43!"), HasSubstr("44!"), HasSubstr("45!")));
}

}  // namespace
}  // namespace raidinfo
