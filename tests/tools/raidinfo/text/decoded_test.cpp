#include "text/decoded.h"

#include <gtest/gtest.h>

#include <string>

namespace raidinfo {
namespace {

TEST(DecodedText, KeepsPlainAndUtf8Text) {
    EXPECT_EQ(decoded("Pellion 5i, 40 °C, 日本 🛠"), "Pellion 5i, 40 °C, 日本 🛠");
    EXPECT_EQ(decoded(""), "");
}

TEST(DecodedText, DecodesPredefinedEntities) {
    EXPECT_EQ(decoded("a &lt;b&gt; &amp; &quot;c&quot; &apos;d&apos;"), "a <b> & \"c\" 'd'");
}

TEST(DecodedText, DecodesNumericReferences) {
    EXPECT_EQ(decoded("&#65;&#x42;&#xe9;&#8364;&#x1F6E0;&#x0010FFFF;"), "ABé€🛠\U0010FFFF");
}

TEST(DecodedText, DecodesOnlyOnce) { EXPECT_EQ(decoded("&amp;lt;&#38;amp;"), "&lt;&amp;"); }

TEST(DecodedText, LeavesWhatIsNoReferenceAsItIs) {
    for (const std::string text :
         {"&", "&;", "a & b;", "&nbsp;", "&AMP;", "&amp", "&#;", "&#x;", "&#0;", "&#xD800;",
          "&#xDFFF;", "&#x110000;", "&#99999999999;", "&#-1;", "&#+1;", "&#x 41;", "&#6a;",
          "&#00000000000000000065;"}) {
        EXPECT_EQ(decoded(text), text);
    }
}

TEST(DecodedText, ReplacesBytesThatAreNotUtf8) {
    EXPECT_EQ(decoded("40 \xB0\x43"), "40 \uFFFDC");
    EXPECT_EQ(decoded("\xC0\x80"), "\uFFFD\uFFFD") << "overlong";
    EXPECT_EQ(decoded("\xE0\x80\x80"), "\uFFFD\uFFFD\uFFFD") << "overlong";
    EXPECT_EQ(decoded("\xED\xA0\x80"), "\uFFFD\uFFFD\uFFFD") << "surrogate";
    EXPECT_EQ(decoded("\xF4\x90\x80\x80"), "\uFFFD\uFFFD\uFFFD\uFFFD") << "too large";
    EXPECT_EQ(decoded("\xF0\x9F\x9B"
                      "A"),
              "\uFFFD"
              "A")
        << "cut short";
    EXPECT_EQ(decoded("\xE2\x82"), "\uFFFD") << "cut short by the end";
    EXPECT_EQ(decoded("\xFF&amp;\xFE"), "\uFFFD&\uFFFD");
}

}  // namespace
}  // namespace raidinfo
