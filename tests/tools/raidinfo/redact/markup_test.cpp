#include "redact/markup.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

namespace raidinfo::redact {
namespace {

using testing::ElementsAre;

// Each piece with a letter for its sort, a tag with its name.
std::vector<std::string> piecesOf(std::string_view document) {
    std::vector<std::string> texts;
    for (const Piece& piece : cutUp(document)) {
        std::string text(1, std::string_view{"tse/o"}.at(static_cast<std::size_t>(piece.form)));
        text += "[" + std::string{piece.bytes} + "]";
        texts.push_back(text + std::string{piece.name});
    }
    return texts;
}

TEST(Markup, IsCutIntoTagsAndTexts) {
    EXPECT_THAT(piecesOf("a<b c=\"d\">e</b>\n<f/>"),
                ElementsAre("t[a]", "s[<b c=\"d\">]b", "t[e]", "/[</b>]b", "t[\n]", "e[<f/>]f"));
    EXPECT_THAT(piecesOf(""), ElementsAre());
}

TEST(Markup, HasTagsWrittenInManyWays) {
    EXPECT_THAT(piecesOf("<a b='\"' c = \">\" / d>"), ElementsAre("s[<a b='\"' c = \">\" / d>]a"));
    EXPECT_THAT(piecesOf("< a\n></ a >"), ElementsAre("s[< a\n>]a", "/[</ a >]a"));
    EXPECT_THAT(piecesOf("<a =></a/>"), ElementsAre("s[<a =>]a", "/[</a/>]a"));
}

TEST(Markup, HasTheContentOfSectionsAndCommentsAsText) {
    EXPECT_THAT(piecesOf("<![CDATA[a]]><!--b--><?c?><!d>"),
                ElementsAre("o[<![CDATA[]", "t[a]]>]", "o[<!--]", "t[b-->]", "o[<?]", "t[c?>]",
                            "o[<!]", "t[d>]"));
}

TEST(Markup, EndsABrokenTagWithItsLastWholeAttribute) {
    EXPECT_THAT(piecesOf("<a b=\"c\" d<e>"), ElementsAre("s[<a b=\"c\"]a", "t[ d]", "s[<e>]e"));
    EXPECT_THAT(piecesOf("<a b=\"c\" d=\"e"), ElementsAre("s[<a b=\"c\"]a", "t[ d=\"e]"));
    EXPECT_THAT(piecesOf("<a x</a>"), ElementsAre("s[<a]a", "t[ x]", "/[</a>]a"));
    EXPECT_THAT(piecesOf("<a"), ElementsAre("s[<a]a"));
    EXPECT_THAT(piecesOf("</a"), ElementsAre("/[</a]a"));
}

TEST(Markup, EndsATagThatRunsOnIntoItsTextWithItsName) {
    EXPECT_THAT(piecesOf("<a:bc</a:b>"), ElementsAre("s[<a:b]a:b", "t[c]", "/[</a:b>]a:b"));
    EXPECT_THAT(piecesOf("<a:bc</a:c>"), ElementsAre("s[<a:bc]a:bc", "/[</a:c>]a:c"));
}

TEST(Markup, EndsATagWithAnOpenQuoteAtTheNextBracket) {
    EXPECT_THAT(piecesOf("<a b=\"c>d</a><e f=\"g\">"),
                ElementsAre("s[<a b=\"c>]a", "t[d]", "/[</a>]a", "s[<e f=\"g\">]e"));
}

TEST(Markup, HasBracketsThatAreNoTag) {
    EXPECT_THAT(piecesOf("<<>< >a<"),
                ElementsAre("o[<]", "o[<]", "t[>]", "o[< ]", "t[>a]", "o[<]"));
}

TEST(Markup, PutTogetherIsTheDocument) {
    const std::string document = "<a b='c'>d<![CDATA[e]]></a><f/ g=\"\">< h='</i>\"><";
    for (std::size_t from = 0; from < document.size(); ++from) {
        for (std::size_t length = 0; from + length <= document.size(); ++length) {
            const std::string part = document.substr(from, length);
            std::string together;
            for (const Piece& piece : cutUp(part)) {
                ASSERT_FALSE(piece.bytes.empty());
                together += piece.bytes;
            }
            ASSERT_EQ(together, part);
        }
    }
}

}  // namespace
}  // namespace raidinfo::redact
