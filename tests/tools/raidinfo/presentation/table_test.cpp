#include "presentation/table.h"

#include <gtest/gtest.h>

#include "listing/column_choice.h"
#include "sample.h"

namespace raidinfo {
namespace {

using test::sample;

const Kind& fans = kindOf(KindId::fan);

Listing listingOfFans(const Records& records) {
    Snapshot snapshot;
    snapshot.of(KindId::fan) = records;
    return listingOf(fans, snapshot, {"adapters", {}});
}

TEST(StatusWord, HasTheLookOfItsMeaning) {
    const Kind& drives = kindOf(KindId::diskDrive);
    const Field& status =
        drives.fields[static_cast<std::size_t>(fieldIndex(drives, "overall_status"))];
    EXPECT_EQ(styleOf(std::string{"Normal"}, &status), Style::good);
    EXPECT_EQ(styleOf(std::string{"Warning"}, &status), Style::warning);
    EXPECT_EQ(styleOf(std::string{"Critical"}, &status), Style::critical);
    EXPECT_EQ(styleOf(Unknown{}, &status), Style::unknown);
    EXPECT_EQ(styleOf(std::string{"Critical"}, &drives.fields[0]), Style::plain);
    EXPECT_EQ(styleOf(std::string{"Critical"}, nullptr), Style::plain);
}

TEST(Table, AlignsNumbersToTheRightAndTextsToTheLeft) {
    const Listing listing = withColumns(
        listingOfFans(
            {sample(fans, {{"fan_name", "Disk Drive 0"}, {"status_name", "é"}, {"status", 5}}),
             sample(fans, {{"fan_name", "日本"}, {"status", -1234567}})}),
        chosenColumns(parseColumns("position,fan_name,status_name,status"), fans));
    EXPECT_EQ(titledTable(listing, {}, CodeBook{}),
              "Fans: 2\n"
              "  #  Fan name      Status name    Status\n"
              "  0  Disk Drive 0  é                   5\n"
              "  1  日本          -            -1234567\n");
}

TEST(Table, HasTheKindInFrontOfEachRowWhereSeveralKindsFollowEachOther) {
    const Listing listing =
        withColumns(listingOfFans({sample(fans, {{"status", 5}}), sample(fans, {{"status", 6}})}),
                    chosenColumns(parseColumns("position,status"), fans));
    EXPECT_EQ(namedTable(listing, {.headings = false}, CodeBook{}),
              "  fans  0  5\n"
              "  fans  1  6\n");
}

TEST(Table, HasTheMeaningOfACodeBesideIt) {
    CodeBook book;
    book.define("fans", "status", CodeBook::Codes{{5, "slow"}});
    const Listing listing =
        withColumns(listingOfFans({sample(fans, {{"status", 5}}), sample(fans, {{"status", 123}})}),
                    chosenColumns(parseColumns("position,status"), fans));
    EXPECT_EQ(table(listing, {}, book),
              "  #  Status\n"
              "  0  5 (slow)\n"
              "  1  123 (unknown)\n");
}

TEST(Table, OfNoRecordsIsItsTitle) {
    EXPECT_EQ(titledTable(listingOfFans({}), {}, CodeBook{}), "Fans: 0\n");
}

}  // namespace
}  // namespace raidinfo
