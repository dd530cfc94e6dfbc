#include "state/path.h"

#include <gtest/gtest.h>

#include <string>

#include "running_service.h"
#include "state/document.h"

namespace raidsim {
namespace {

std::size_t countOf(std::string_view path) {
    Document document = Document::parse(test::smallSystem());
    return findAll(document.edit(), Path::parse(path)).size();
}

std::string errorOf(std::string_view path) {
    try {
        (void)Path::parse(path);
    } catch (const PathError& error) {
        return error.what();
    }
    return "none";
}

TEST(Path, FindsEveryListingOfADrive) {
    EXPECT_EQ(countOf("adapter:1/channel:1/drive:0"), 2U);  // in the array, under its channel
    EXPECT_EQ(countOf("adapter:1/channel:2/drive:0"), 2U);  // hot spare, under its channel
}

TEST(Path, LevelsMayBeLeftOutAndNumbersBeAny) {
    EXPECT_EQ(countOf("drive:0"), 4U);
    EXPECT_EQ(countOf("drive:*"), 4U);
    EXPECT_EQ(countOf("array:7/drive:0"), 1U);
    EXPECT_EQ(countOf("spares/drive:*"), 1U);
    EXPECT_EQ(countOf("system"), 1U);
    EXPECT_EQ(countOf("physicals"), 2U);
}

TEST(Path, FindsNothingWhereTheNumbersDiffer) {
    EXPECT_EQ(countOf("adapter:2/drive:0"), 0U);
    EXPECT_EQ(countOf("adapter:1/channel:1/drive:1"), 0U);
    EXPECT_EQ(countOf("array:7/channel:2"), 0U);
}

TEST(Path, ErrorsSayWhatIsWrong) {
    EXPECT_EQ(errorOf("disk:1"), "there is no kind of object \"disk\"");
    EXPECT_EQ(errorOf(""), "there is no kind of object \"\"");
    EXPECT_EQ(errorOf("adapter:1/"), "there is no kind of object \"\"");
    EXPECT_EQ(errorOf("adapter"), "\"adapter\" needs a number");
    EXPECT_EQ(errorOf("adapter:one"), "\"one\" is not a number");
    EXPECT_EQ(errorOf("adapter:"), "\"\" is not a number");
    EXPECT_EQ(errorOf("spares:1"), "\"spares\" takes no number");
}

}  // namespace
}  // namespace raidsim
