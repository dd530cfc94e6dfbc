// The readers' ways to the units that come next.

#include "xml/unit_reader.h"

#include <gtest/gtest.h>

#include <array>
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

constexpr auto beginnings = [] {
    std::array<std::string_view, 9> made{};
    made.fill("<as:any xsi:type=");
    made[7] = "<as:size xsi:type=";
    made[8] = "<as:state xsi:type=";
    return made;
}();
constexpr std::array<KnownTag, 10> nothingKnown{};
constexpr Names lengths{&lengthOfName, nothingKnown, TagIndex(beginnings)};
constexpr Names otherLengths = lengths;

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
    EXPECT_EQ(units.next(units.tagsOf(lengths)).number, 1);
    EXPECT_EQ(units.next(units.tagsOf(lengths)).number, 7);
    const auto& five = units.next(units.tagsOf(lengths));
    EXPECT_EQ(five.number, 4);
    EXPECT_FALSE(five.unit.isTag);
    EXPECT_EQ(five.unit.name, "five");
    EXPECT_TRUE(units.next(units.tagsOf(lengths)).unit.closing);
    EXPECT_FALSE(units.next(units.tagsOf(lengths)).unit.finished);
    EXPECT_FALSE(units.next(units.tagsOf(lengths)).unit.finished);
}

TEST_F(UnitReading, LooksUpTheNameOfARepeatedTagOnce) {
    std::string text;
    for (int i = 0; i < 10; ++i) {
        text += "\n    " + sizeTag + "<as:state xsi:type='xsd:string'>";
    }
    auto units = readerOf(text);
    for (int i = 0; i < 10; ++i) {
        const auto& size = units.next(units.tagsOf(lengths));
        EXPECT_EQ(size.number, 7);
        EXPECT_TRUE(size.unit.isTag);
        EXPECT_TRUE(size.unit.opening);
        EXPECT_FALSE(size.unit.closing);
        EXPECT_TRUE(size.unit.finished);
        EXPECT_EQ(size.unit.name, "as:size");
        EXPECT_EQ(size.unit.type, "xsd:int");
        EXPECT_EQ(units.next(units.tagsOf(lengths)).unit.type, "xsd:string");
    }
    EXPECT_EQ(asked, 2);
    EXPECT_EQ(units.remaining(), 0);
}

TEST_F(UnitReading, LooksUpTheNameOfTheFirstChildOnce) {
    constexpr auto beyondSix = [](std::string_view name) { return lengthOfName(name) - 7; };
    constexpr std::array<std::string_view, 2> ofChildren{"<as:size xsi:type=",
                                                         "<as:state xsi:type="};
    static constexpr std::array<KnownTag, 3> unseen{};
    static constexpr Names names{beyondSix, unseen, TagIndex(ofChildren)};
    const std::string text = sizeTag + sizeTag + sizeTag;
    auto units = readerOf(text);
    for (int i = 0; i < 3; ++i) {
        EXPECT_EQ(units.next(units.tagsOf(names)).number, 0);
    }
    EXPECT_EQ(asked, 1);
}

TEST_F(UnitReading, LooksANameUpForEachClass) {
    const std::string text = sizeTag + sizeTag + sizeTag;
    auto units = readerOf(text);
    units.next(units.tagsOf(lengths));
    units.next(units.tagsOf(otherLengths));
    EXPECT_EQ(asked, 2);
    units.next(units.tagsOf(lengths));
    EXPECT_EQ(asked, 2);
}

TEST_F(UnitReading, RecallsNothingForTheTrace) {
    writeLogLevel(9);
    const std::string text = " " + sizeTag + sizeTag;
    auto units = readerOf(text);
    units.next(units.tagsOf(lengths));
    EXPECT_TRUE(
        readLog().starts_with("Enter ParseDefUnit length=57\nstate 0, char  \nstate 0, char <"));
    EXPECT_EQ(units.next(units.tagsOf(lengths)).unit.name, "as:size");
    EXPECT_EQ(asked, 2);
    const auto log = readLog();
    EXPECT_NE(log.find("element as:size\n"), log.rfind("element as:size\n"));
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
        EXPECT_EQ(units.plainText("</as:size>"), found);
        EXPECT_EQ(units.remaining(), 1) << text;
        auto cut = readerOf(text);
        EXPECT_EQ(cut.plainText("</as:size>"), found);
        EXPECT_EQ(cut.remaining(), 0) << text;
    }
}

TEST_F(UnitReading, LeavesATextThatEndsInAnyOtherWay) {
    for (const std::string text :
         {"", "5", "5<", "5</", "5</as:size", "5</as:size >", "5</as:sizes>", "5</as:type>",
          "5<as:size>", "5<as:size/>", "<a/></as:size>", "5</as:siz"}) {
        auto units = readerOf(text);
        EXPECT_EQ(units.plainText("</as:size>"), std::nullopt) << text;
        EXPECT_EQ(units.remaining(), static_cast<int>(text.size())) << text;
    }
}

TEST_F(UnitReading, LooksForAPlainTextUpToItsLengthOnly) {
    const std::string text = "5</as:size>";
    for (int length = 0; length < static_cast<int>(text.size()); ++length) {
        UnitReader units(text.data(), length);
        EXPECT_EQ(units.plainText("</as:size>"), std::nullopt) << length;
        EXPECT_EQ(units.remaining(), length);
    }
}

TEST_F(UnitReading, TakesNoShortWayPastTheTrace) {
    writeLogLevel(9);
    const std::string end = "</as:size>";
    auto units = readerOf(end);
    EXPECT_EQ(units.plainText("</as:size>"), std::nullopt);
    EXPECT_EQ(units.remaining(), static_cast<int>(end.size()));
    EXPECT_EQ(readLog(), "");
}

TEST_F(UnitReading, ReadsNothingOfANegativeLength) {
    UnitReader units("<a>", -1);
    EXPECT_FALSE(units.next().finished);
    EXPECT_FALSE(units.next(units.tagsOf(lengths)).unit.finished);
    EXPECT_EQ(units.consumed(), 0);
}

}  // namespace
