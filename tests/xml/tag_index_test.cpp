// Finding the tag that a text may begin with.

#include "xml/tag_index.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace {

using raid::xml::TagIndex;

TEST(TagIndex, FindsEachOfTheTags) {
    const std::vector<std::string_view> tags{
        "<as:firmwareLevel xsi",  "<as:vendor xsi:type=",   "<as:type xsi:type=\"xs",
        "<as:size xsi:type=\"xs", "<as:isAssignedHotSpare", "<as:isGlobalHotSpare ",
        "<as:hotSpareType xsi:t"};
    const TagIndex index(tags);
    for (std::size_t place = 0; place < tags.size(); ++place) {
        EXPECT_EQ(index.candidate(tags[place].data()), place) << tags[place];
    }
}

TEST(TagIndex, FindsTheFirstOfThoseThatItCannotTellApart) {
    const std::vector<std::string_view> tags{
        "<as:writeCacheEnable", "<as:writeCacheEnableSupported", "<as:size xsi:type=\"xsd:int\">"};
    const TagIndex index(tags);
    EXPECT_EQ(index.candidate(tags[0].data()), 0U);
    EXPECT_EQ(index.candidate(tags[1].data()), 0U);
    EXPECT_EQ(index.candidate(tags[2].data()), 2U);
}

TEST(TagIndex, LooksNoFurtherThanTheShortestTag) {
    const std::vector<std::string_view> tags{"<as:name xsi:type=\"xsd:string\">",
                                             "<as:size xsi:type=\"xsd:int\">"};
    const TagIndex index(tags);
    ASSERT_EQ(index.reach(), 28U);
    for (std::size_t place = 0; place < tags.size(); ++place) {
        // Copied, so that a look behind the end is a look out of the block.
        const std::vector<char> text(tags[place].begin(), tags[place].begin() + 28);
        EXPECT_EQ(index.candidate(text.data()), place);
    }
}

TEST(TagIndex, AnswersForAnyText) {
    const std::vector<std::string_view> tags{"<as:name xsi:type=\"xsd:string\">",
                                             "<as:size xsi:type=\"xsd:int\">"};
    const TagIndex index(tags);
    for (int byte = 0; byte < 256; ++byte) {
        const std::string text(index.reach(), static_cast<char>(byte));
        EXPECT_LT(index.candidate(text.data()), tags.size());
    }
    EXPECT_EQ(TagIndex(std::vector<std::string_view>{}).candidate(tags[0].data()), 0U);
}

}  // namespace
