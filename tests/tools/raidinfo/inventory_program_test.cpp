#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <nlohmann/json.hpp>
#include <set>

#include "documents.h"
#include "program.h"
#include "scripted.h"

namespace raidinfo::test {
namespace {

using nlohmann::json;
using testing::HasSubstr;
using testing::StartsWith;

Result runWith(const std::string& document, std::vector<std::string> arguments) {
    const ScriptedService service{{answering(document)}};
    return run(std::move(arguments));
}

json dataOf(const Result& result) {
    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.errors, "");
    const json document = json::parse(result.output);
    EXPECT_EQ(document["complete"], true);
    return document["data"];
}

TEST(ListCommand, ShowsEveryListAsATable) {
    const Result result = runWith(configuration(sampleAdapter()), {"list"});
    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.errors, "");
    EXPECT_THAT(result.output,
                StartsWith("Pellion adapters: 1\n  #  Adapter type      Adapter name  "));
    EXPECT_THAT(result.output, HasSubstr("\n\nChannels: 2\n"
                                         "  #  Channel name    Adapter name  Channel ID  Adapter ID"
                                         "  Type               Transfer speed  Initiator ID\n"
                                         "  0  SCSI Channel 1  Controller 0           1           0"
                                         "  0 (parallel SCSI)          0 MB/s             7\n"));
    EXPECT_THAT(result.output, HasSubstr("  Smith & Sons  "));
    EXPECT_THAT(result.output, HasSubstr("\n\nPower supplies: 0\n\nTemperature sensors: 2\n"));
}

// The library prints a line for every exchange on its process's standard output.
TEST(ListCommand, KeepsTheOutputOfTheLibraryOutOfItsOwn) {
    const Result result = runWith(configuration(sampleAdapter()), {"list"});
    EXPECT_EQ(result.output.find("isset"), std::string::npos);
    EXPECT_EQ(result.errors, "");
}

TEST(ListCommand, WritesEveryFieldAsJson) {
    const json lists = dataOf(runWith(configuration(sampleAdapter()), {"list", "--json"}));
    EXPECT_EQ(lists.size(), 12U);
    EXPECT_EQ(lists["arrays"].size(), 2U);
    EXPECT_EQ(lists["fans"].size(), 3U);
    EXPECT_EQ(lists["pellion_adapters"][0]["initiator_ids"], json({7, 7}));
    EXPECT_EQ(lists["pellion_adapters"][0]["overall_status"], "Warning");
    EXPECT_EQ(lists["disk_drives"][1], json::parse(R"({
        "position": 1, "device_id": 2, "hot_spare": true, "disk_drive_name": "Disk Drive 0", "channel_name": "Channel 1",
        "adapter_name": "Controller 0", "overall_status": "Normal", "channel_id": 1,
        "adapter_id": 0, "array_id": 0, "array_unique_id": 0, "vendor": "Smith & Sons",
        "model": "", "serial_number": "", "fru_number": "", "firmware_level": "",
        "size": 34715, "state": 0, "smart_error": false, "type": 0, "has_os_partition": false,
        "write_cache_enable": 0, "write_cache_enable_supported": false})"));
}

TEST(ListCommand, ShowsAnUnknownAsNull) {
    const std::string adapter =
        complex("adapter", "o:LSIAdapter", simple({{"overallStatus", "3"}}));
    const json lists = dataOf(runWith(configuration(adapter), {"list", "--json"}));
    EXPECT_TRUE(lists["lsi_adapters"][0]["overall_status"].is_null());
}

TEST(ListCommand, WritesValidJsonForBytesThatAreNotUtf8) {
    const std::string adapter =
        complex("adapter", "o:DorvelAdapter", simple({{"typeName", "caf\xE9 &#xe9; &lt;\x01."}}));
    const json lists = dataOf(runWith(configuration(adapter), {"list", "--json"}));
    EXPECT_EQ(lists["vantry_adapters"][0]["type_name"], "caf\uFFFD é <\x01.");
}

TEST(ListCommand, ShowsATextOfAnyLength) {
    const std::string text(3'000'000, 'x');
    const std::string adapter =
        complex("adapter", "o:LSIAdapter", simple({{"serialNumber", text}, {"partNumber", "p"}}));
    const json lists = dataOf(runWith(configuration(adapter), {"list", "--json"}));
    EXPECT_EQ(lists["lsi_adapters"][0]["serial_number"], text);
    EXPECT_EQ(lists["lsi_adapters"][0]["part_number"], "p");
}

TEST(ListCommand, HasNoErrorForAnEmptySystem) {
    const json lists = dataOf(runWith(configuration(""), {"list", "--json"}));
    for (const json& list : lists) {
        EXPECT_EQ(list, json::array());
    }
}

TEST(ListCommand, HasNoTitlesInJsonToLeaveOut) {
    const std::string answer = configuration(sampleAdapter());
    EXPECT_EQ(dataOf(runWith(answer, {"list", "fans", "--noheadings", "--json"})),
              dataOf(runWith(answer, {"list", "fans", "--json"})));
}

TEST(ListCommand, IsFinishedWhenTheAnswerComesAfterTheFirstProbe) {
    // The configuration fails, the service answers the probe, the second configuration is good.
    const ScriptedService service{{raid::test::Connection{},
                                   answering(raid::test::newestEventDocument("0")),
                                   answering(configuration(""))}};
    EXPECT_EQ(run({"list"}).status, 0);
}

TEST(TreeCommand, ShowsWhatBelongsToWhat) {
    const Result result =
        runWith(configuration(sampleAdapter() +
                              complex("adapter", "o:Other", simple({{"adapterID", "3"}}))),
                {"tree"});
    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.errors, "");
    EXPECT_EQ(
        result.output,
        "Pellion adapter 0: Warning, type name Pellion 4220, physical slot 0\n"
        "├─ Channel 1: transfer speed 0 MB/s, initiator ID 7\n"
        "│  ├─ Disk drive 0: Normal, vendor Smith & Sons, size 34715 MB, state 0 (ready)\n"
        "│  ├─ Disk drive 2: hot spare, Normal, vendor Smith & Sons, size 34715 MB, state 0 "
        "(ready)\n"
        "│  └─ Enclosure 15: Normal, state 0 (absent)\n"
        "│     ├─ Fan 0: status 1 (warning)\n"
        "│     └─ Temperature sensor 0: status 40 (unknown)\n"
        "├─ Channel 2: transfer speed 0 MB/s, initiator ID 7\n"
        "│  ├─ Disk drive 0: Normal, vendor Smith & Sons, size 34715 MB, state 0 (ready)\n"
        "│  └─ Enclosure 14: Normal, state 0 (absent)\n"
        "│     ├─ Fan 0: status 1 (warning)\n"
        "│     ├─ Fan 1: status 1 (warning)\n"
        "│     └─ Temperature sensor 0: status 40 (unknown)\n"
        "├─ Array 0: size 0 MB, free space 0 MB, stripe size 0 KB\n"
        "│  ├─ Logical drive 0: Normal, RAID level 5 (RAID 5), state 0 (normal), data space 0 MB\n"
        "│  ├─ Disk drive 0: channel 1\n"
        "│  └─ Disk drive 9: channel 1, not present\n"
        "├─ Spanned array 5: size 0 MB, free space 0 MB, stripe size 0 KB\n"
        "│  ├─ Logical drive 1: Normal, RAID level 5 (RAID 5), state 0 (normal), data space 0 MB\n"
        "│  └─ Array 6: size 0 MB, free space 0 MB, stripe size 0 KB\n"
        "│     └─ Disk drive 0: channel 2\n"
        "└─ Logical drive 2: Normal, RAID level 5 (RAID 5), state 0 (normal), data space 0 MB\n"
        "Adapter 3: unknown type \"o:Other\"\n");
}

TEST(TreeCommand, NestsTheSameAsJson) {
    const json tree = dataOf(runWith(configuration(sampleAdapter()), {"tree", "--json"}));
    const json& adapter = tree["adapters"][0];
    EXPECT_EQ(adapter["family"], "pellion");
    EXPECT_EQ(adapter["channels"][1]["enclosures"][0]["fans"].size(), 2U);
    EXPECT_EQ(adapter["channels"][0]["disk_drives"][1]["hot_spare"], true);
    EXPECT_EQ(adapter["channels"][0]["disk_drives"][1]["device_id"], 2);
    EXPECT_EQ(adapter["arrays"][0]["disk_drives"], json::parse(R"([
        {"position": 0, "channel_id": 1, "device_id": 0, "present": true},
        {"channel_id": 1, "device_id": 9, "present": false}])"));
    EXPECT_EQ(adapter["arrays"][0]["logical_drives"][0]["logical_drive_id"], 0);
    EXPECT_EQ(adapter["spanned_arrays"][0]["arrays"][0]["array_id"], 6);
    EXPECT_EQ(adapter["spanned_arrays"][0]["arrays"][0]["position"], 1);
    EXPECT_EQ(adapter["logical_drives"].size(), 1U);
}

TEST(TreeCommand, ShowsAnUnpublishedArrayInsideTwoSpannedArrays) {
    std::string arrays = complex("basicArray", "o:BasicArray", simple({{"arrayID", "3"}}));
    for (const std::string id : {"2", "1"}) {
        arrays = complex("spannedArray", "o:SpannedArray",
                         simple({{"arrayID", id}}) + complex("arrays", "o:Arrays", arrays));
    }
    const std::string adapter =
        complex("adapter", "o:LSIAdapter", complex("arrays", "o:Arrays", arrays));
    EXPECT_EQ(runWith(configuration(adapter), {"tree"}).output,
              "LSI adapter 0: Normal, physical slot 0\n"
              "└─ Spanned array 1: size 0 MB, free space 0 MB, stripe size 0 KB\n"
              "   └─ Spanned array 2: not published\n"
              "      └─ Array 3: not published\n");
}

TEST(TreeCommand, HasNoErrorForAnEmptySystem) {
    const Result result = runWith(configuration(""), {"tree"});
    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.output, "No adapters\n");
}

}  // namespace
}  // namespace raidinfo::test
