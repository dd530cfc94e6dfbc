// What every class with a vocabulary does with its own element.

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <iterator>
#include <sstream>
#include <string>
#include <string_view>
#include <vector>

#include "classes.h"
#include "model/event_classes.h"
#include "support/elements.h"
#include "support/files.h"
#include "support/fresh_library.h"

namespace {

using namespace raid::test;

class ElementReading : public FreshLibrary, public testing::WithParamInterface<ModelClass> {
protected:
    const ModelClass& model = GetParam();

    [[nodiscard]] std::string around(const std::string& content) const {
        return element(model.element, content);
    }

    // Reads an element that must be good and is the whole text.
    [[nodiscard]] std::vector<std::string> valuesOf(const std::string& text) const {
        const auto reading = model.read(text);
        EXPECT_EQ(reading.error, "") << text;
        EXPECT_EQ(reading.consumed, static_cast<int>(text.size())) << text;
        return reading.values;
    }

    [[nodiscard]] std::string errorOf(const std::string& text) const {
        return model.read(text).error;
    }

    [[nodiscard]] std::vector<std::string> startValues() const {
        std::vector<std::string> values;
        std::ranges::transform(model.fields, std::back_inserter(values), [](const Field& field) {
            return field.kind == Kind::text ? "" : "0";
        });
        return values;
    }

    // A text that the field shows unlike its start value, and what it shows.
    static std::pair<std::string, std::string> sample(const Field& field) {
        return field.kind == Kind::flag ? std::pair("true", "1") : std::pair("42", "42");
    }
};

TEST_P(ElementReading, GivesEachChildToItsFieldAndNoOther) {
    for (std::size_t i = 0; i < model.fields.size(); ++i) {
        const auto [sent, shown] = sample(model.fields[i]);
        auto expected = startValues();
        expected[i] = shown;
        EXPECT_EQ(valuesOf(around(element("as:" + model.fields[i].name, sent))), expected)
            << model.fields[i].name;
    }
}

TEST_P(ElementReading, MakesAValueWhoseCopiesShowTheSame) {
    std::string content;
    for (const auto& field : model.fields) {
        content += element("as:" + field.name, sample(field).first);
    }
    const auto readings = model.readAsValues(element(model.element, content, "o:Type"));
    EXPECT_EQ(readings.front().type, "o:Type");
    EXPECT_EQ(readings, std::vector(readings.size(), readings.front()));
}

TEST_P(ElementReading, KeepsAFieldWhoseElementIsEmptyEitherWay) {
    for (std::size_t i = 0; i < model.fields.size(); ++i) {
        const auto tag = "as:" + model.fields[i].name;
        const auto [sent, shown] = sample(model.fields[i]);
        for (const auto& empty : {element(tag, ""), element(tag, " \n"), "<" + tag + "/>"}) {
            EXPECT_EQ(valuesOf(around(empty)), startValues()) << empty;
            EXPECT_EQ(valuesOf(around(element(tag, sent) + empty))[i], shown) << empty;
        }
    }
}

TEST_P(ElementReading, LetsTheLastOfRepeatedChildrenHold) {
    for (std::size_t i = 0; i < model.fields.size(); ++i) {
        const auto tag = "as:" + model.fields[i].name;
        const auto [sent, shown] = sample(model.fields[i]);
        EXPECT_EQ(valuesOf(around(element(tag, "7") + element(tag, sent)))[i], shown);
    }
}

TEST_P(ElementReading, TakesNumbersByTheirLeadingDigitsAndFlagsByTheExactWord) {
    struct Conversion {
        std::string sent, number, flag;
    };
    const std::vector<Conversion> conversions{
        {"12abc", "12", "0"},
        {"abc", "0", "0"},
        {"-5", "-5", "0"},
        {"+5", "5", "0"},
        {"0x1F", "0", "0"},
        {"true", "0", "1"},
        {"True", "0", "0"},
        {"1", "1", "0"},
        {" true ", "0", "1"},
        {"2147483648", "2147483647", "0"},
        {"-99999999999999999999999999999999999999999", "-2147483648", "0"},
    };
    for (std::size_t i = 0; i < model.fields.size(); ++i) {
        const auto& field = model.fields[i];
        for (const auto& conversion : conversions) {
            if (field.kind != Kind::text) {
                EXPECT_EQ(valuesOf(around(element("as:" + field.name, conversion.sent)))[i],
                          field.kind == Kind::flag ? conversion.flag : conversion.number)
                    << field.name << " from " << conversion.sent;
            }
        }
    }
}

TEST_P(ElementReading, KeepsATextButForTheSpaceAroundIt) {
    for (std::size_t i = 0; i < model.fields.size(); ++i) {
        if (model.fields[i].kind == Kind::text) {
            const auto tag = "as:" + model.fields[i].name;
            EXPECT_EQ(valuesOf(around(element(tag, "\n a &amp;  b\t")))[i], "a &amp;  b");
        }
    }
}

TEST_P(ElementReading, NamesTheFieldWhoseEndTagIsMissing) {
    for (const auto& field : model.fields) {
        const auto start = "<" + model.element + "><as:" + field.name + ">";
        const auto& word = field.endWord;
        EXPECT_EQ(errorOf(start + "1</as:wrong>"), model.missing(word, "as:wrong"));
        EXPECT_EQ(errorOf(start + "</" + model.element + ">"), model.missing(word, model.element));
        EXPECT_EQ(errorOf(start + "1<as:" + field.name + ">"),
                  model.missing(word, "as:" + field.name));
        EXPECT_EQ(errorOf(start + "<!-- x='' -->"), model.missing(word, "!--"));
        EXPECT_EQ(errorOf(start + "1"), model.missing(word, ""));
    }
}

TEST_P(ElementReading, NamesItselfForTheStrayEndTagOfAChild) {
    for (const auto& field : model.fields) {
        EXPECT_EQ(errorOf(around("</as:" + field.name + ">")),
                  model.missing(model.endWord, "as:" + field.name));
    }
}

TEST_P(ElementReading, CallsItsOwnStartTagInsideItselfByTheCommonName) {
    EXPECT_EQ(errorOf(around(around(""))), model.missing("name", model.element));
}

TEST_P(ElementReading, RejectsWhatItDoesNotKnow) {
    for (const char* const name : {"as:color", "color", "AC:CHANNEL", "!--"}) {
        EXPECT_EQ(errorOf(around(element(name, "1"))), model.unknown(name));
        EXPECT_EQ(errorOf(around("</" + std::string(name) + ">")), model.unknown(name));
    }
    EXPECT_EQ(errorOf(around(" stray text ")), model.unknown("stray text"));
}

TEST_P(ElementReading, RejectsAnotherFirstUnit) {
    EXPECT_EQ(errorOf("<ac:other>"), model.unknown("ac:other"));
    EXPECT_EQ(errorOf("</" + model.element + ">"), model.unknown(model.element));
    EXPECT_EQ(errorOf("text<"), model.unknown("text"));
}

TEST_P(ElementReading, NeverSucceedsOnATextThatEndsBeforeTheElement) {
    std::string content;
    for (const auto& field : model.fields) {
        content += element("as:" + field.name, "1");
    }
    const auto whole = element(model.element, content, "o:Type");
    ASSERT_EQ(errorOf(whole), "");
    for (std::size_t length = 0; length < whole.size(); ++length) {
        EXPECT_TRUE(errorOf(whole.substr(0, length)).starts_with("XML syntax error: End of \""))
            << length;
    }
    EXPECT_EQ(errorOf(whole.substr(0, whole.size() - 1)), model.missing(model.endWord, ""));
}

TEST_P(ElementReading, TakesTheLastTypeAttribute) {
    const auto typeOf = [&](const std::string& attributes) {
        return model.read("<" + model.element + attributes + "/>").type;
    };
    EXPECT_EQ(typeOf(""), "");
    EXPECT_EQ(typeOf(" type='x' XSI:TYPE='y'"), "");
    EXPECT_EQ(typeOf(" xsi:type='o:One' id=\"7\" xsi:type=\"o:Two\""), "o:Two");
}

TEST_P(ElementReading, ReportsTheBytesUpToItsEndTagAndReadsNoFurther) {
    const auto text = "  \n" + around(" ");
    EXPECT_EQ(model.read(text + "<ac:next>&<<").consumed, static_cast<int>(text.size()));
}

TEST_P(ElementReading, IsEmptyAsAnEmptyElementTag) {
    EXPECT_EQ(valuesOf("<" + model.element + "/>"), startValues());
    EXPECT_EQ(valuesOf("<" + model.element + "></" + model.element + ">"), startValues());
}

INSTANTIATE_TEST_SUITE_P(Of, ElementReading, testing::ValuesIn(modelClasses()), nameOfRow);
INSTANTIATE_TEST_SUITE_P(OfEvents, ElementReading, testing::ValuesIn(eventClasses()), nameOfRow);

// The lines of the constructors in the trace of reading a text: all but the tokenizer's.
std::vector<std::string> constructorLines() {
    constexpr std::array<std::string_view, 4> tokenizers{"Enter ParseDefUnit length=", "state ",
                                                         "element ", "CDATA "};
    std::vector<std::string> lines;
    std::istringstream log(readLog());
    for (std::string line; std::getline(log, line);) {
        if (std::ranges::none_of(tokenizers,
                                 [&](std::string_view start) { return line.starts_with(start); })) {
            lines.push_back(line);
        }
    }
    return lines;
}

class ElementTrace : public ElementReading {
protected:
    ElementTrace() { writeLogLevel(9); }
};

TEST_P(ElementTrace, HasALineAtEntryAndOneAtExit) {
    ASSERT_EQ(errorOf(around("")), "");
    EXPECT_EQ(constructorLines(),
              std::vector<std::string>(
                  {model.name + " Constructor", "Exit " + model.exitName + " Constructor"}));
}

TEST_P(ElementTrace, HasNoExitLineAfterAnError) {
    ASSERT_NE(errorOf("<" + model.element + ">"), "");
    EXPECT_EQ(constructorLines(), std::vector<std::string>({model.name + " Constructor"}));
}

INSTANTIATE_TEST_SUITE_P(Of, ElementTrace, testing::ValuesIn(modelClasses()), nameOfRow);
INSTANTIATE_TEST_SUITE_P(OfEvents, ElementTrace, testing::ValuesIn(eventClasses()), nameOfRow);
INSTANTIATE_TEST_SUITE_P(OfPassed, ElementTrace, testing::ValuesIn(passedClasses()), nameOfRow);

class PassedElement : public ElementReading {};

TEST_P(PassedElement, PassesOverEverythingUpToItsEndTag) {
    const auto text = around("text<as:a>1</as:b><ac:x/></ac:y><!-- x=''>" + ("<" + model.element) +
                             ">" + ("<" + model.element) + "/>");
    EXPECT_EQ(errorOf(text), "");
    EXPECT_EQ(model.read(text + "<more>").consumed, static_cast<int>(text.size()));
}

TEST_P(PassedElement, NamesItselfWhenItsEndTagIsMissing) {
    EXPECT_EQ(errorOf("<" + model.element + "><a>"), model.missing(model.endWord, ""));
    EXPECT_EQ(errorOf("<ac:other/>"), model.unknown("ac:other"));
}

INSTANTIATE_TEST_SUITE_P(Of, PassedElement, testing::ValuesIn(passedClasses()), nameOfRow);

}  // namespace
