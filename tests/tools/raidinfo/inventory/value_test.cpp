#include "inventory/value.h"

#include <gtest/gtest.h>

namespace raidinfo {
namespace {

TEST(ShownValue, IsShortAndPlain) {
    EXPECT_EQ(shown(-7), "-7");
    EXPECT_EQ(shown(true), "yes");
    EXPECT_EQ(shown(false), "no");
    EXPECT_EQ(shown(std::string{"A&B"}), "A&B");
    EXPECT_EQ(shown(std::string{}), "-");
    EXPECT_EQ(shown(std::string{"a\nb"}), "a\\u{a}b");
    EXPECT_EQ(shown(Unknown{}), "unknown");
    EXPECT_EQ(shown(std::vector<int>{7, -1, 7}), "7,-1,7");
    EXPECT_EQ(shown(std::vector<int>{}), "-");
}

}  // namespace
}  // namespace raidinfo
