// Cutting units off the front of a document.

#include <gtest/gtest.h>

#include <string>
#include <utility>
#include <vector>

#include "support/fresh_library.h"
#include "support/row.h"
#include "xml/parse_def_unit.h"

namespace {

using namespace raid::test;

using Attributes = std::vector<std::pair<std::string, std::string>>;

enum class Tag { none, start, end, empty };

struct Unit : Row {
    std::string text;  // of the document, from the unit on
    std::string named;
    Tag tag;
    Attributes attributes;
    int consumed;
};

const std::vector<Unit> units{
    {"StartTag", "<a>x", "a", Tag::start, {}, 3},
    {"EndTag", "</a>x", "a", Tag::end, {}, 4},
    {"EmptyElementTag", "<x/>y", "x", Tag::empty, {}, 4},
    {"EmptyElementTagWithAttribute", "<x a='1'/>", "x", Tag::empty, {{"a", "1"}}, 10},
    {"Prolog", "<?xml version='1.0' ?>", "?xml", Tag::start, {{"version", "1.0"}}, 22},
    {"PrologWithoutAttributes", "<?xml?>", "?xml?", Tag::start, {}, 7},
    {"SpaceBeforeTheTag", "   <a>", "a", Tag::start, {}, 6},
    {"SpaceInsideTheTag", "< a  >", "a", Tag::start, {}, 6},
    {"EndTagWithSpaceAfterTheName", "</a >", "a", Tag::end, {}, 5},
    {"EndTagWithSpaceBeforeTheSlash", "< /a>", "a", Tag::end, {}, 5},
    {"EndTagWithSpaceAfterTheSlashLosesItsName", "</ a='1'>", "", Tag::end, {{"a", "1"}}, 9},
    {"NamelessTag", "</>", "", Tag::end, {}, 3},
    {"GreaterSignAsFirstOfTheName", "<>>", ">", Tag::start, {}, 3},
    {"TypeAttribute",
     "<as:size xsi:type=\"xsd:int\">",
     "as:size",
     Tag::start,
     {{"xsi:type", "xsd:int"}},
     28},
    {"SpaceAroundTheEqualsSign", "<a b = 'c'>", "a", Tag::start, {{"b", "c"}}, 11},
    {"JunkAfterTheAttributeName", "<a b x = 'c'>", "a", Tag::start, {{"b", "c"}}, 13},
    {"JunkAfterTheEqualsSign", "<a b=x'c'>", "a", Tag::start, {{"b", "c"}}, 10},
    {"QuotesOfTheOtherKindInsideValues",
     "<a b='\"' c=\"'\">",
     "a",
     Tag::start,
     {{"b", "\""}, {"c", "'"}},
     15},
    {"RepeatedAttributes", "<a b='1' b='2'>", "a", Tag::start, {{"b", "1"}, {"b", "2"}}, 15},
    {"AttributesWithoutSpaceBetween",
     "<a b='1'c='2'>",
     "a",
     Tag::start,
     {{"b", "1"}, {"c", "2"}},
     14},
    {"EmptyValue", "<a b=''>", "a", Tag::start, {{"b", ""}}, 8},
    {"MarkupInsideAValue", "<a b='<x/>'>", "a", Tag::start, {{"b", "<x/>"}}, 12},
    {"NothingCountsAfterASlash", "<a / b='1'>", "a", Tag::empty, {}, 11},
    {"NothingCountsAfterAQuestionMark", "<a ? b='1'>", "a", Tag::start, {}, 11},
    {"NothingCountsAfterASlashBehindTheName", "<a/ b='1'>", "a", Tag::empty, {}, 10},
    {"AttributeWithoutValueSwallowsWhatFollows",
     "<a b><c d='1'>",
     "a",
     Tag::start,
     {{"b><c", "1"}},
     14},
    {"CommentSwallowsWhatFollows", "<!-- x --><a b='c'>", "!--", Tag::start, {{"x", "c"}}, 19},
    {"ReferencesInValuesStay", "<a b='&lt;'>", "a", Tag::start, {{"b", "&lt;"}}, 12},
    {"Text", "hello<", "hello", Tag::none, {}, 5},
    {"TextKeepsItsInnerSpace", "  hello world  </a>", "hello world", Tag::none, {}, 15},
    {"ReferencesInTextStay", "&lt;&#65;<", "&lt;&#65;", Tag::none, {}, 9},
    {"TextWithGreaterSignAndQuotes", "a>'\"/<", "a>'\"/", Tag::none, {}, 5},
    {"TextEndsAreTrimmedOfHighSpace", "\x80\xFFx\xA0\x7F<", "x", Tag::none, {}, 5},
    {"TextOfHighBytes", "\xC3\xA4\xC3\xBC<", "\xC3\xA4\xC3\xBC", Tag::none, {}, 4},
};

// A unit read from a text of exactly its bytes.
ParseDefUnit parse(const std::string& text) { return {text.data(), static_cast<int>(text.size())}; }

class Tokenizer : public FreshLibrary, public testing::WithParamInterface<Unit> {};

TEST_P(Tokenizer, ReadsTheUnit) {
    const auto& expected = GetParam();
    const auto unit = parse(expected.text);
    EXPECT_EQ(unit.kind, expected.tag == Tag::none ? 0 : 1);
    EXPECT_EQ(unit.name, expected.named);
    EXPECT_EQ(unit.attributes, expected.attributes);
    EXPECT_EQ(unit.opening, expected.tag == Tag::start || expected.tag == Tag::empty);
    EXPECT_EQ(unit.closing, expected.tag == Tag::end || expected.tag == Tag::empty);
    EXPECT_EQ(unit.consumed, expected.consumed);
}

TEST_P(Tokenizer, ConsumesNothingOfAUnitThatIsCutOff) {
    const auto& text = GetParam().text;
    // The "<" behind a text is what ends it.
    const auto needed =
        static_cast<std::size_t>(GetParam().consumed) + (GetParam().tag == Tag::none ? 1 : 0);
    for (std::size_t length = 0; length < needed; ++length) {
        EXPECT_EQ(parse(text.substr(0, length)).consumed, 0) << length;
        EXPECT_EQ(ParseDefUnit(text.data(), static_cast<int>(length)).consumed, 0) << length;
    }
}

INSTANTIATE_TEST_SUITE_P(Units, Tokenizer, testing::ValuesIn(units), nameOfRow);

class TokenizerBounds : public FreshLibrary {};

TEST_F(TokenizerBounds, ReadNothingForALengthBelowOne) {
    for (const int length : {0, -1, -2147483647}) {
        const ParseDefUnit unit("<a>", length);
        EXPECT_EQ(unit.kind, 0);
        EXPECT_EQ(unit.name, "");
        EXPECT_TRUE(unit.attributes.empty());
        EXPECT_FALSE(unit.opening);
        EXPECT_FALSE(unit.closing);
        EXPECT_EQ(unit.consumed, 0);
    }
}

TEST_F(TokenizerBounds, KeepWhatWasGatheredOfAnUnfinishedTag) {
    const auto unit = parse("</a b='1' c");
    EXPECT_EQ(unit.kind, 1);
    EXPECT_EQ(unit.name, "a");
    EXPECT_TRUE(unit.closing);
    EXPECT_EQ(unit.attributes, Attributes({{"b", "1"}}));
    EXPECT_EQ(unit.consumed, 0);
    EXPECT_EQ(parse("<ab").name, "") << "a name ends with a space, a slash or a greater sign";
    EXPECT_EQ(parse("some text").name, "") << "a text ends with the next tag";
}

TEST_F(TokenizerBounds, DoNotLimitNamesTextsAndAttributes) {
    for (const std::size_t size : {127U, 128U, 129U, 1U << 20U}) {
        const std::string filler(size, 'x');
        const auto tag = parse("<" + filler + " " + filler + "='" + filler + "'>");
        EXPECT_EQ(tag.name, filler);
        EXPECT_EQ(tag.attributes, Attributes({{filler, filler}}));
        EXPECT_EQ(parse(filler + "<").name, filler);
    }
    std::string many = "<a";
    for (int i = 0; i < 100000; ++i) {
        many += " b='c'";
    }
    EXPECT_EQ(parse(many + ">").attributes.size(), 100000U);
}

TEST_F(TokenizerBounds, LetUnitsBeCopiedAndMovedWhole) {
    const auto unit = parse("<a b='1' c='2'/>");
    auto copied = unit;
    auto moved = std::move(copied);
    copied = moved;
    moved = parse("text<");
    moved = std::move(copied);
    EXPECT_EQ(moved.kind, 1);
    EXPECT_EQ(moved.name, "a");
    EXPECT_EQ(moved.attributes, Attributes({{"b", "1"}, {"c", "2"}}));
    EXPECT_TRUE(moved.opening);
    EXPECT_TRUE(moved.closing);
    EXPECT_EQ(moved.consumed, 16);
}

TEST(Space, IsEveryByteUpTo32From127To160And255) {
    for (int byte = 0; byte < 256; ++byte) {
        EXPECT_EQ(isSpace(static_cast<unsigned char>(byte)),
                  byte <= 32 || (byte >= 127 && byte <= 160) || byte == 255)
            << byte;
    }
}

TEST(CaseInsensitiveEquality, FoldsLettersAndNothingElse) {
    EXPECT_TRUE(ci_equal("", ""));
    EXPECT_TRUE(ci_equal("as:Size", "AS:sIZE"));
    EXPECT_FALSE(ci_equal("as:size", "as:sizes"));
    EXPECT_FALSE(ci_equal("a[", "a{"));
    EXPECT_FALSE(ci_equal("\xC4", "\xE4"));
}

}  // namespace
