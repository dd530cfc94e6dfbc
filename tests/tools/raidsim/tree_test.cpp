#include "xml/tree.h"

#include <gtest/gtest.h>

#include <string>

#include "bounds.h"

namespace raidsim::xml {
namespace {

constexpr const char* prolog = "<?xml version=\"1.0\" encoding=\"utf-8\"?>\n";

std::string rewritten(std::string_view text) { return format(parse(text)); }

TEST(Tree, IsWrittenIndentedWithStartAndEndTagsInDocumentOrder) {
    EXPECT_EQ(rewritten("<b x='1' a=\"2\"><z/>  <a>t</a><!-- gone --><z>2</z></b>"),
              std::string(prolog) +
                  "<b x=\"1\" a=\"2\">\n"
                  "  <z></z>\n"
                  "  <a>t</a>\n"
                  "  <z>2</z>\n"
                  "</b>\n");
}

TEST(Tree, WritingWhatWasReadChangesNothingMore) {
    const std::string once = rewritten("<a>\n <b>\n  <c/>\n </b>\n</a>\n");
    EXPECT_EQ(rewritten(once), once);
}

TEST(Tree, EscapesOnlyWhatMustBe) {
    EXPECT_EQ(rewritten("<a b='&lt;&quot;'>&amp;&lt;&gt;&quot;&apos;&#228;</a>"),
              std::string(prolog) + "<a b='&lt;\"'>&amp;&lt;&gt;\"'\xC3\xA4</a>\n");
}

TEST(Tree, KeepsBlanksInsideALeaf) {
    EXPECT_EQ(rewritten("<a> two  words </a>"), std::string(prolog) + "<a> two  words </a>\n");
}

TEST(Tree, ValueWithBothQuotesIsEscaped) {
    EXPECT_EQ(rewritten("<a b='&apos;&quot;'></a>"),
              std::string(prolog) + "<a b='&apos;\"'></a>\n");
}

TEST(Tree, ReadsAndWritesTheDeepestDocument) {
    std::string text;
    for (std::size_t i = 0; i < bounds::elementNesting; ++i)
        text += "<a>";
    for (std::size_t i = 0; i < bounds::elementNesting; ++i)
        text += "</a>";
    EXPECT_EQ(rewritten(rewritten(text)), rewritten(text));
}

TEST(Tree, MalformedTextIsRefused) { EXPECT_THROW((void)parse("<a><b></a></b>"), XmlError); }

TEST(Tree, LocalNameHasNoPrefix) {
    EXPECT_EQ(localName("env:Body"), "Body");
    EXPECT_EQ(localName("Body"), "Body");
}

}  // namespace
}  // namespace raidsim::xml
