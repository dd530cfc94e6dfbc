// The readers' ways to the units that come next.

#include "xml/unit_reader.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "support/files.h"
#include "support/fresh_library.h"

namespace {

using namespace raid::test;
using namespace raid::xml;

int asked = 0;  // how often a name had to be looked up

int lengthOfName(std::string_view name) {
    ++asked;
    return static_cast<int>(name.size());
}

constexpr Names lengths{&lengthOfName, 1};
constexpr Names otherLengths{&lengthOfName, 2};

class UnitReading : public FreshLibrary {
protected:
    UnitReading() { asked = 0; }

    static UnitReader readerOf(const std::string& text) {
        return {text.data(), static_cast<int>(text.size())};
    }
};

const std::string sizeTag = "<as:size xsi:type=\"xsd:int\">";

TEST_F(UnitReading, NumbersTheNameOfEveryUnit) {
    const std::string text = "<a>" + sizeTag + " five </as:size><unfinished";
    auto units = readerOf(text);
    EXPECT_EQ(units.next(lengths).number, 1);
    EXPECT_EQ(units.next(lengths).number, 7);
    const auto& five = units.next(lengths);
    EXPECT_EQ(five.number, 4);
    EXPECT_FALSE(five.unit.isTag);
    EXPECT_EQ(five.unit.name, "five");
    EXPECT_TRUE(units.next(lengths).unit.closing);
    EXPECT_FALSE(units.next(lengths).unit.finished);
    EXPECT_FALSE(units.next(lengths).unit.finished);
}

TEST_F(UnitReading, LooksUpTheNameOfARepeatedTagOnce) {
    std::string text;
    for (int i = 0; i < 10; ++i) {
        text += "\n    " + sizeTag + "<as:name xsi:type='xsd:string'>";
    }
    auto units = readerOf(text);
    for (int i = 0; i < 10; ++i) {
        const auto& size = units.next(lengths);
        EXPECT_EQ(size.number, 7);
        EXPECT_TRUE(size.unit.isTag);
        EXPECT_TRUE(size.unit.opening);
        EXPECT_FALSE(size.unit.closing);
        EXPECT_TRUE(size.unit.finished);
        EXPECT_EQ(size.unit.name, "as:size");
        EXPECT_EQ(size.unit.type, "xsd:int");
        EXPECT_EQ(units.next(lengths).unit.type, "xsd:string");
    }
    EXPECT_EQ(asked, 2);
    EXPECT_EQ(units.remaining(), 0);
}

TEST_F(UnitReading, LooksANameUpForEachClass) {
    const std::string text = sizeTag + sizeTag + sizeTag;
    auto units = readerOf(text);
    units.next(lengths);
    units.next(otherLengths);
    EXPECT_EQ(asked, 2);
    units.next(lengths);
    EXPECT_EQ(asked, 2);
}

TEST_F(UnitReading, RecallsNothingForTheTrace) {
    writeLogLevel(9);
    const std::string text = sizeTag + sizeTag;
    auto units = readerOf(text);
    units.next(lengths);
    EXPECT_EQ(units.next(lengths).unit.name, "as:size");
    EXPECT_EQ(asked, 2);
    const auto log = readLog();
    EXPECT_NE(log.find("element as:size\n"), log.rfind("element as:size\n"));
}

TEST_F(UnitReading, PassesAPlainEndTagOfTheElement) {
    for (const auto* const space : {"", "\n", "\n          ", "   "}) {
        const auto text = std::string(space) + "</ac:fan><";
        auto units = readerOf(text);
        EXPECT_TRUE(units.passEnd("ac:fan"));
        EXPECT_EQ(units.remaining(), 1);
    }
}

TEST_F(UnitReading, LeavesEveryOtherUnitWhereItIs) {
    for (const std::string text :
         {"", "</ac:fan", "</ac:fan >", "</ac:fans>", "</ac:fat>", "< /ac:fan>", "<ac:fan/>",
          "<ac:fan>", "text</ac:fan>", "<//c:fan>", ".</ac:fan>"}) {
        auto units = readerOf(text);
        EXPECT_FALSE(units.passEnd("ac:fan")) << text;
        EXPECT_EQ(units.remaining(), static_cast<int>(text.size())) << text;
        const auto longer = text + "          ";
        EXPECT_FALSE(readerOf(longer).passEnd("ac:fan")) << longer;
    }
}

TEST_F(UnitReading, TakesAPlainTextWithItsEndTag) {
    struct Case {
        std::string text;
        std::string found;
    };
    const std::vector<Case> cases{
        {"5</as:size>", "5"},
        {"</as:size>", ""},
        {" \n</as:size>", ""},
        {" a b \n</as:size>", "a b"},
        {"a long text, which has several words of a machine</as:size>",
         "a long text, which has several words of a machine"},
        {"1 > 0 & \"</as:size>", "1 > 0 & \""},
    };
    for (const auto& [text, found] : cases) {
        const auto rest = text + "<";
        auto units = readerOf(rest);
        EXPECT_EQ(units.plainText("as:size"), found);
        EXPECT_EQ(units.remaining(), 1) << text;
        auto cut = readerOf(text);
        EXPECT_EQ(cut.plainText("as:size"), found);
        EXPECT_EQ(cut.remaining(), 0) << text;
    }
}

TEST_F(UnitReading, LeavesATextThatEndsInAnyOtherWay) {
    for (const std::string text :
         {"", "5", "5<", "5</", "5</as:size", "5</as:size >", "5</as:sizes>", "5</as:type>",
          "5<as:size>", "5<as:size/>", "<a/></as:size>", "5</as:siz"}) {
        auto units = readerOf(text);
        EXPECT_EQ(units.plainText("as:size"), std::nullopt) << text;
        EXPECT_EQ(units.remaining(), static_cast<int>(text.size())) << text;
    }
}

TEST_F(UnitReading, TakesNoShortWayPastTheTrace) {
    writeLogLevel(9);
    const std::string end = "</as:size>";
    auto units = readerOf(end);
    EXPECT_FALSE(units.passEnd("as:size"));
    EXPECT_EQ(units.plainText("as:size"), std::nullopt);
    EXPECT_EQ(units.remaining(), static_cast<int>(end.size()));
    EXPECT_EQ(readLog(), "");
}

TEST_F(UnitReading, ReadsNothingOfANegativeLength) {
    UnitReader units("<a>", -1);
    EXPECT_FALSE(units.next().finished);
    EXPECT_FALSE(units.next(lengths).unit.finished);
    EXPECT_FALSE(units.passEnd("a"));
    EXPECT_EQ(units.consumed(), 0);
}

}  // namespace
