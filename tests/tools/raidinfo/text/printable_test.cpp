#include "text/printable.h"

#include <gtest/gtest.h>

namespace raidinfo {
namespace {

TEST(PrintableText, EscapesControlCharacters) {
    EXPECT_EQ(printable("a\tb\nc"), "a\\u{9}b\\u{a}c");
    EXPECT_EQ(printable("\x1B[2J\x7F"), "\\u{1b}[2J\\u{7f}");
    EXPECT_EQ(printable("\u009B2J"), "\\u{9b}2J") << "the one-character form of ESC [";
    EXPECT_EQ(printable("\u202Eabc\u2066"), "\\u{202e}abc\\u{2066}") << "reverses what follows";
    EXPECT_EQ(printable("é 日本"), "é 日本");
}

TEST(TitleInASentence, BeginsSmallUnlessItIsAnAbbreviation) {
    EXPECT_EQ(inSentence("Physical slot"), "physical slot");
    EXPECT_EQ(inSentence("SMART error"), "SMART error");
    EXPECT_EQ(inSentence(""), "");
}

}  // namespace
}  // namespace raidinfo
