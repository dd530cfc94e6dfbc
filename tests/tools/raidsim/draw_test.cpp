#include "control/draw.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <limits>
#include <vector>

namespace raidsim {
namespace {

using testing::Each;
using testing::ElementsAre;
using testing::Gt;

TEST(Draw, GivesTheSameNumbersForEver) {
    Draw draw({1, 2, 3});
    EXPECT_THAT((std::vector{draw.next(), draw.next(), draw.next()}),
                ElementsAre(2399657773382937285U, 8067101194408944102U, 17615266516125549910U));
}

TEST(Draw, DependsOnEveryPartOfThePlaceAndOnTheirOrder) {
    EXPECT_NE(Draw({1, 2}).next(), Draw({2, 1}).next());
    EXPECT_NE(Draw({1, 2}).next(), Draw({1, 3}).next());
    EXPECT_NE(Draw({1, 2}).next(), Draw({1, 2, 0}).next());
    EXPECT_EQ(Draw({1, 2}).next(), Draw({1, 2}).next());
}

TEST(Draw, StaysBelowItsBoundAndReachesEveryNumber) {
    Draw draw({7});
    std::vector<int> times(6);
    for (int i = 0; i < 6000; ++i)
        ++times.at(static_cast<std::size_t>(draw.below(6)));
    EXPECT_THAT(times, Each(Gt(850)));
    EXPECT_EQ(draw.below(1), 0U);
}

TEST(Draw, TakesTheLargestBound) {
    constexpr auto largest = std::numeric_limits<std::uint64_t>::max();
    Draw draw({7});
    for (int i = 0; i < 100; ++i)
        EXPECT_LT(draw.below(largest), largest);
}

// Two thirds of all numbers: taking the remainder alone would favour the lower half.
TEST(Draw, FavoursNoNumberWhereTheBoundDoesNotDivideTheRange) {
    constexpr std::uint64_t bound = std::numeric_limits<std::uint64_t>::max() / 3 * 2;
    Draw draw({7});
    int lower = 0;
    for (int i = 0; i < 3000; ++i)
        lower += draw.below(bound) < bound / 2 ? 1 : 0;
    EXPECT_NEAR(lower, 1500, 120);
}

}  // namespace
}  // namespace raidsim
