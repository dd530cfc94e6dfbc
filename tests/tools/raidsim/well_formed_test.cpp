#include "xml/well_formed.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "bounds.h"
#include "xml/tree.h"

namespace raidsim::xml {
namespace {

std::string faultOf(std::string_view text) {
    try {
        checkWellFormed(text);
    } catch (const XmlError& error) {
        return error.what();
    }
    return "none";
}

TEST(WellFormed, AcceptsPrologCommentsCdataAttributesAndReferences) {
    EXPECT_EQ(faultOf("\xEF\xBB\xBF<?xml version='1.0' ?>\n<!-- <b> -->\n"
                      "<a:b c='\"' d = \"'>\"><e/><![CDATA[ </x> & ]]>&amp;&#228;&#xE4;</a:b >\n"),
              "none");
}

struct Malformed {
    const char* text;
    const char* fault;
};

const std::vector<Malformed> malformed{
    {"", "line 1: there is no element"},
    {"<!-- only -->", "line 1: there is no element"},
    {"<a>\n<b>\n</a>", "line 3: end tag of \"a\" where \"b\" is open"},
    {"</a>", "line 1: end tag of \"a\" where no element is open"},
    {"<a>\n<b/>\n", "line 3: element \"a\" is not closed"},
    {"<a/>\n<b/>", "line 2: a second root element"},
    {"x<a/>", "line 1: text outside of the root element"},
    {"<a/><![CDATA[x]]>", "line 1: text outside of the root element"},
    {"<a>&nbsp;</a>", "line 1: an unknown reference after \"&\""},
    {"<a>R&D</a>", "line 1: an unknown reference after \"&\""},
    {"<a>&#0;</a>", "line 1: an unknown reference after \"&\""},
    {"<a>&#xD800;</a>", "line 1: an unknown reference after \"&\""},
    {"<a>&#1114112;</a>", "line 1: an unknown reference after \"&\""},
    {"<a>&#;</a>", "line 1: an unknown reference after \"&\""},
    {"<a b='&x;'/>", "line 1: an unknown reference after \"&\""},
    {"<a>\x01</a>", "line 1: a control character"},
    {"<a b=c/>", "line 1: attribute \"b\" has no quoted value"},
    {"<a b/>", "line 1: attribute \"b\" has no quoted value"},
    {"<a b='c/>", "line 1: attribute \"b\" has no quoted value"},
    {"<a b='<'/>", "line 1: \"<\" in the value of attribute \"b\""},
    {"<a b=''c=''/>", "line 1: the tag of \"a\" is not closed"},
    {"<a", "line 1: the tag of \"a\" is not closed"},
    {"<a></a", "line 1: the end tag of \"a\" is not closed"},
    {"< a/>", "line 1: a name is missing"},
    {"<", "line 1: a name is missing"},
    {"<a><!-- </a>", "line 1: a comment is not closed"},
    {"<a><![CDATA[</a>", "line 1: a CDATA section is not closed"},
    {"<?xml <a/>", "line 1: a processing instruction is not closed"},
    {"<!DOCTYPE a []><a/>", "line 1: declarations are not accepted"}};

TEST(WellFormed, RefusesMalformedTextsNamingTheLine) {
    for (const auto& [text, fault] : malformed)
        EXPECT_EQ(faultOf(text), fault) << text;
}

TEST(WellFormed, RefusesNestingBeyondTheLimitAndNoEarlier) {
    const auto nested = [](std::size_t depth) {
        std::string text;
        for (std::size_t i = 0; i < depth; ++i)
            text += "<a>";
        for (std::size_t i = 0; i < depth; ++i)
            text += "</a>";
        return text;
    };
    EXPECT_EQ(faultOf(nested(bounds::elementNesting)), "none");
    EXPECT_EQ(faultOf(nested(bounds::elementNesting + 1)),
              "line 1: elements are nested too deeply");
}

TEST(WellFormed, RefusesANulByte) {
    EXPECT_EQ(faultOf(std::string_view("<a>\0</a>", 8)), "line 1: a control character");
}

}  // namespace
}  // namespace raidsim::xml
