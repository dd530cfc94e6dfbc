#include "xml/elements.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "xml/well_formed.h"

namespace raidsim::xml {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

TEST(Elements, AreFoundWithAllTheirBytes) {
    EXPECT_THAT(elementsOf("<a>x<b c='1'>y</b >z<b/><b\n/></a>", "b"),
                ElementsAre("<b c='1'>y</b >", "<b/>", "<b\n/>"));
    EXPECT_THAT(elementsOf("<b/>", "b"), ElementsAre("<b/>"));
}

TEST(Elements, MayHoldThoseOfTheSameName) {
    EXPECT_THAT(elementsOf("<a><b><b/><c><b></b></c></b><b></b></a>", "b"),
                ElementsAre("<b><b/><c><b></b></c></b>", "<b></b>"));
}

TEST(Elements, AreNoneInCommentsInstructionsAndCharacterData) {
    constexpr std::string_view text =
        "<?b <b>?><a><!-- <b> --><![CDATA[<b>]]><b x='/>'><!--</b>--></b></a>";
    EXPECT_NO_THROW(checkWellFormed(text));
    EXPECT_THAT(elementsOf(text, "b"), ElementsAre("<b x='/>'><!--</b>--></b>"));
}

TEST(Elements, HaveExactlyTheName) {
    EXPECT_THAT(elementsOf("<bb><ab/><b:b/><b.></b.></bb>", "b"), IsEmpty());
}

}  // namespace
}  // namespace raidsim::xml
