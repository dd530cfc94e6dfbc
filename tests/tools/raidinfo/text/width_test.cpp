#include "text/width.h"

#include <gtest/gtest.h>

namespace raidinfo {
namespace {

TEST(DisplayWidth, CountsColumnsOfTheTerminal) {
    EXPECT_EQ(displayWidth(""), 0U);
    EXPECT_EQ(displayWidth("abc"), 3U);
    EXPECT_EQ(displayWidth("40 °C"), 5U);
    EXPECT_EQ(displayWidth("日本"), 4U);
    EXPECT_EQ(displayWidth("e\u0301"), 1U) << "a combining accent";
    EXPECT_EQ(displayWidth("\uFFFD"), 1U);
}

TEST(ShortenedText, KeepsWhatFits) {
    EXPECT_EQ(shortened("abc", 3), "abc");
    EXPECT_EQ(shortened("日本", 4), "日本");
    EXPECT_EQ(shortened("", 0), "");
}

TEST(ShortenedText, EndsWithASignThatItIsCut) {
    EXPECT_EQ(shortened("abcd", 3), "ab…");
    EXPECT_EQ(shortened("abcd", 1), "…");
    EXPECT_EQ(shortened("abcd", 0), "");
}

TEST(ShortenedText, CutsBetweenCharacters) {
    EXPECT_EQ(shortened("日本語", 4), "日…") << "a half of the second has no room";
    EXPECT_EQ(shortened("e\u0301a\u0301b", 2), "e\u0301…");
}

}  // namespace
}  // namespace raidinfo
