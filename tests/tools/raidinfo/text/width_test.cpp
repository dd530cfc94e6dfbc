#include "text/width.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace raidinfo {
namespace {

using testing::ElementsAre;

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

TEST(Folded, BreaksAtSpacesAndIndents) {
    EXPECT_THAT(folded("* ", "one two three", 7), ElementsAre("* one", "  two", "  three"));
    EXPECT_THAT(folded("* ", "one two", 80), ElementsAre("* one two"));
    EXPECT_THAT(folded("└─ ", "one  two", 7), ElementsAre("└─ one", "   two"));
}

TEST(Folded, BreaksAWordThatIsTooLong) {
    EXPECT_THAT(folded("", "äöüäöü", 4), ElementsAre("äöüä", "öü"));
    EXPECT_THAT(folded("", "漢字", 3), ElementsAre("漢", "字"));
}

TEST(Folded, ComesToAnEndWithoutRoom) {
    EXPECT_THAT(folded("12345", "abc", 4), ElementsAre("1…ab", "  c"));
    EXPECT_THAT(folded("", "ab", 0), ElementsAre("a", "b"));
    EXPECT_THAT(folded("", "", 0), ElementsAre(""));
}

}  // namespace
}  // namespace raidinfo
