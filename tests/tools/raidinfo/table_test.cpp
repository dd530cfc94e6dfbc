#include "table.h"

#include <gtest/gtest.h>

#include "sample.h"

namespace raidinfo {
namespace {

using test::sample;

const Kind& fans = kindOf(KindId::fan);

TEST(ShownValue, IsShortAndPlain) {
    EXPECT_EQ(shown(-7), "-7");
    EXPECT_EQ(shown(true), "yes");
    EXPECT_EQ(shown(false), "no");
    EXPECT_EQ(shown(std::string{"A&B"}), "A&B");
    EXPECT_EQ(shown(std::string{}), "-");
    EXPECT_EQ(shown(std::string{"a\nb"}), "a\\u{a}b");
    EXPECT_EQ(shown(UnknownStatus{}), "unknown");
    EXPECT_EQ(shown(std::vector<int>{7, -1, 7}), "7,-1,7");
    EXPECT_EQ(shown(std::vector<int>{}), "-");
}

TEST(Table, AlignsNumbersToTheRightAndTextsToTheLeft) {
    const Records records{
        sample(fans, {{"fan_name", "Disk Drive 0"}, {"status_name", "é"}, {"status", 5}}),
        sample(fans, {{"fan_name", "日本"}, {"channel_name", "Channel 12"}, {"status", -1234567}})};
    EXPECT_EQ(table(fans, records),
              "Fans: 2\n"
              "  #  Fan name      Status name  Channel name  Adapter name    Status"
              "  Enclosure ID  Channel ID  Adapter ID\n"
              "  0  Disk Drive 0  é            -             -                    5"
              "             0           0           0\n"
              "  1  日本          -            Channel 12    -             -1234567"
              "             0           0           0\n");
}

TEST(Table, EndsNoLineWithABlank) {
    const Kind& drives = kindOf(KindId::diskDrive);
    const std::string text = table(drives, {sample(drives, {})});
    EXPECT_EQ(text.find(" \n"), std::string::npos);
}

TEST(Table, OfNoRecordsIsItsTitle) { EXPECT_EQ(table(fans, {}), "Fans: 0\n"); }

TEST(Tables, ShowEveryKindAlsoTheEmptyOnes) {
    Snapshot snapshot;
    EXPECT_EQ(tables(snapshot),
              "Pellion adapters: 0\n\nLSI adapters: 0\n\nVantry adapters: 0\n\nChannels: 0\n\n"
              "Arrays: 0\n\nSpanned arrays: 0\n\nLogical drives: 0\n\nDisk drives: 0\n\n"
              "Enclosures: 0\n\nFans: 0\n\nPower supplies: 0\n\nTemperature sensors: 0\n");
}

}  // namespace
}  // namespace raidinfo
