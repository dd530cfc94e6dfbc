// What the tokenizer writes to the log at level 9.

#include <gtest/gtest.h>

#include <string>
#include <utility>
#include <vector>

#include "support/files.h"
#include "support/fresh_library.h"
#include "xml/parse_def_unit.h"

namespace {

using namespace raid::test;

using TracedUnit = FreshLibrary;

TEST_F(TracedUnit, IsTheSameUnit) {
    writeLogLevel(9);
    const std::string text = "<a b='c' d=\"e\"/>";
    const ParseDefUnit unit(text.data(), static_cast<int>(text.size()));
    EXPECT_EQ(unit.kind, 1);
    EXPECT_EQ(unit.name, "a");
    EXPECT_TRUE(unit.opening);
    EXPECT_TRUE(unit.closing);
    EXPECT_EQ(unit.consumed, static_cast<int>(text.size()));
    const std::vector<std::pair<std::string, std::string>> attributes{{"b", "c"}, {"d", "e"}};
    EXPECT_EQ(unit.attributes, attributes);
}

class TokenizerTrace : public FreshLibrary {
protected:
    static std::string traceOf(const std::string& text, int level = 9) {
        writeLogLevel(level);
        const ParseDefUnit unit(text.data(), static_cast<int>(text.size()));
        return readLog();
    }
};

TEST_F(TokenizerTrace, ShowsEveryCharacterOfATagBeforeWhatItEnds) {
    EXPECT_EQ(traceOf(" <a b='c' />"),
              "Enter ParseDefUnit length=12\n"
              "state 0, char  \n"
              "state 0, char <\n"
              "state 2, char a\n"
              "state 3, char  \n"
              "element a\n"
              "state 4, char b\n"
              "state 5, char =\n"
              "state 7, char '\n"
              "state 9, char c\n"
              "state 9, char '\n"
              "Attribute: b=c\n"
              "state 4, char  \n"
              "state 4, char /\n"
              "state 10, char >\n");
}

TEST_F(TokenizerTrace, ShowsADoubleQuotedValueAndSpaceAfterAName) {
    EXPECT_EQ(traceOf("</a b =\"c\">"),
              "Enter ParseDefUnit length=11\n"
              "state 0, char <\n"
              "state 2, char /\n"
              "state 3, char a\n"
              "state 3, char  \n"
              "element a\n"
              "state 4, char b\n"
              "state 5, char  \n"
              "state 6, char =\n"
              "state 7, char \"\n"
              "state 8, char c\n"
              "state 8, char \"\n"
              "Attribute: b=c\n"
              "state 4, char >\n");
}

TEST_F(TokenizerTrace, ShowsATextTrimmedAndAPercentSignAsItStands) {
    EXPECT_EQ(traceOf("5 % <"),
              "Enter ParseDefUnit length=5\n"
              "state 0, char 5\n"
              "state 1, char  \n"
              "state 1, char %\n"
              "state 1, char  \n"
              "state 1, char <\n"
              "CDATA 5 %\n");
}

TEST_F(TokenizerTrace, ExpandsAConversionInAText) {
    EXPECT_TRUE(traceOf("a%d<").ends_with("CDATA a0\n"));
}

TEST_F(TokenizerTrace, ShowsAZeroByteAsTheEndOfItsLine) {
    EXPECT_EQ(traceOf(std::string("\0<", 2)),
              "Enter ParseDefUnit length=2\n"
              "state 0, char state 0, char <\n");
}

TEST_F(TokenizerTrace, ShowsNamesOfAnyLength) {
    const std::string name(1000, 'n');
    EXPECT_TRUE(traceOf("<" + name + ">").ends_with("element " + name + "\n"));
}

TEST_F(TokenizerTrace, ShowsTextsOfAnyLength) {
    const std::string text(1000, 't');
    EXPECT_TRUE(traceOf(text + "<").ends_with("CDATA " + text + "\n"));
}

TEST_F(TokenizerTrace, ShowsOnlyTheEntryForALengthBelowOne) {
    EXPECT_EQ(traceOf(""), "Enter ParseDefUnit length=0\n");
    const ParseDefUnit unit("<a>", -1);
    EXPECT_EQ(readLog(), "Enter ParseDefUnit length=0\nEnter ParseDefUnit length=-1\n");
}

TEST_F(TokenizerTrace, IsSilentBelowLevel9) { EXPECT_EQ(traceOf("<a b='c'/>", 8), ""); }

}  // namespace
