#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

#include "diff/diff.h"
#include "diff/snapshot_file.h"
#include "trees.h"

namespace raidinfo::diff {
namespace {

using namespace test;
using testing::HasSubstr;
using testing::Not;

// Two snapshots of the small server; a test edits the later one.
class Changes : public testing::Test {
protected:
    [[nodiscard]] std::string told() const { return diff::told(changes(before, after, codes())); }

    // Takes a drive out of its channel and its array.
    Json pulled(int channel, int device) {
        taken(arrayOf(after)["disk_drives"], "device_id", device);
        return taken(drivesOf(after, channel), "device_id", device);
    }

    Json before = smallServer();
    Json after = before;
};

TEST_F(Changes, AreNoneBetweenEqualTrees) { EXPECT_EQ(told(), "No changes\n"); }

TEST_F(Changes, TellADriveThatWasReplaced) {
    driveOf(after, 1, 3)["serial_number"] = "QS0101077K";
    EXPECT_EQ(told(),
              "        adapter 1, channel 1, device 3: drive replaced, "
              "serial QS0101003K → QS0101077K\n");
}

TEST_F(Changes, TellADriveThatMoved) {
    Json moved = pulled(1, 3);
    moved["channel_id"] = 2;
    moved["device_id"] = 5;
    drivesOf(after, 2).push_back(moved);
    EXPECT_EQ(told(),
              "        adapter 1, channel 2, device 5: drive moved from channel 1 device 3, "
              "left array 0\n");
}

TEST_F(Changes, TellTwoDrivesThatWereSwapped) {
    std::swap(driveOf(after, 1, 0)["serial_number"], driveOf(after, 1, 1)["serial_number"]);
    EXPECT_EQ(told(),
              "        adapter 1, channel 1, device 0: drive moved from device 1\n"
              "        adapter 1, channel 1, device 1: drive moved from device 0\n");
}

TEST_F(Changes, TellADriveThatMovedAndItsSuccessorApart) {
    Json moved = driveOf(after, 1, 3);
    moved["device_id"] = 6;
    drivesOf(after, 1).push_back(moved);
    driveOf(after, 1, 3)["serial_number"] = "QS0101077K";
    EXPECT_EQ(told(),
              "better  adapter 1, channel 1, device 3: drive added, serial number QS0101077K, "
              "Normal, state 1 (online), vendor QUILLON, size 70006 MB, in array 0\n"
              "        adapter 1, channel 1, device 6: drive moved from device 3, left array 0\n");
}

TEST_F(Changes, TellADriveThatWasAdded) {
    drivesOf(after, 2).push_back(drive(2, 2, 6, "QS0102002K"));
    driveOf(after, 2, 2)["hot_spare"] = true;
    EXPECT_EQ(told(),
              "better  adapter 1, channel 2, device 2: drive added, serial number QS0102002K, "
              "Normal, state 1 (online), hot spare, vendor QUILLON, size 70006 MB\n");
}

TEST_F(Changes, TellADriveThatWasRemovedAndTheMemberThatIsMissing) {
    taken(drivesOf(after, 1), "device_id", 3);
    Json& member = arrayOf(after)["disk_drives"][3];
    member.erase("position");
    member["present"] = false;
    EXPECT_EQ(told(),
              "worse   adapter 1, channel 1, device 3: drive removed, serial number QS0101003K, "
              "Normal, state 1 (online), vendor QUILLON, size 70006 MB, in array 0\n"
              "worse   adapter 1, array 0: misses channel 1 device 3\n");
    std::swap(before, after);
    EXPECT_THAT(told(),
                HasSubstr("better  adapter 1, array 0: no longer misses channel 1 device 3\n"));
}

TEST_F(Changes, TellWhatBecomesAHotSpareAndWhatCeasesToBeOne) {
    driveOf(after, 1, 3)["hot_spare"] = true;
    driveOf(after, 2, 1)["hot_spare"] = false;
    EXPECT_EQ(told(),
              "        adapter 1, channel 1, device 3: became hot spare\n"
              "        adapter 1, channel 2, device 1: no longer hot spare\n");
}

TEST_F(Changes, TellWhichDriveJoinsAnArrayAndWhichLeavesIt) {
    Json& members = arrayOf(after)["disk_drives"];
    taken(members, "device_id", 3);
    members.push_back(member(2, 1, 5));
    EXPECT_EQ(told(),
              "        adapter 1, channel 1, device 3: left array 0\n"
              "        adapter 1, channel 2, device 1: joined array 0\n");
}

TEST_F(Changes, DoNotRepeatTheArrayByItsNumber) {
    Json array = arrayOf(after);
    array["array_id"] = 1;
    array["position"] = 1;
    array["logical_drives"] =
        Json::array({taken(arrayOf(after)["logical_drives"], "logical_drive_id", 1)});
    array["logical_drives"][0]["array_id"] = 1;
    array["disk_drives"] = Json::array();
    adapterOf(after)["arrays"].push_back(array);
    EXPECT_EQ(told(),
              "better  adapter 1, array 1: array added, size 350030 MB, free space 0 MB, stripe "
              "size 0 KB\n"
              "        adapter 1, logical drive 1: left array 0, joined array 1\n");
}

TEST_F(Changes, TellAnArrayNumberThatDoesNotFollowTheArrays) {
    driveOf(after, 1, 3)["array_id"] = 4;
    EXPECT_EQ(told(), "        adapter 1, channel 1, device 3: array ID 0 → 4\n");
}

TEST_F(Changes, TellNewFirmware) {
    adapterOf(after)["firmware_version"] = "5.21.00";
    driveOf(after, 1, 0)["firmware_level"] = "B41A";
    EXPECT_EQ(told(),
              "        adapter 1: firmware updated 5.20.01 → 5.21.00\n"
              "        adapter 1, channel 1, device 0: firmware updated - → B41A\n");
}

TEST_F(Changes, GroupWhatChangedOfOneRecordTheStateFirst) {
    Json& drive = driveOf(after, 1, 3);
    drive["size"] = 140012;
    drive["smart_error"] = true;
    drive["state"] = 4;
    drive["overall_status"] = "Critical";
    EXPECT_EQ(told(),
              "worse   adapter 1, channel 1, device 3: Normal → Critical, state 1 (online) → "
              "4 (failed), SMART error, size 70006 MB → 140012 MB\n");
}

TEST_F(Changes, AreJudgedByTheWeightiest) {
    Json& drive = driveOf(before, 1, 3);
    drive["overall_status"] = "Critical";
    driveOf(after, 1, 3)["smart_error"] = true;
    EXPECT_EQ(told(), "better  adapter 1, channel 1, device 3: Critical → Normal, SMART error\n");
}

TEST_F(Changes, TellListsOfNumbersAndFlags) {
    adapterOf(after)["initiator_ids"] = {7, 6};
    adapterOf(after)["clustering"] = true;
    EXPECT_EQ(told(), "        adapter 1: clustering no → yes, initiator IDs 7,7 → 7,6\n");
}

TEST_F(Changes, CountThePartsThatGoWithAnEnclosure) {
    adapterOf(after)["channels"][0]["enclosures"] = Json::array();
    adapterOf(before)["channels"][0]["enclosures"][0]["fans"].erase(1);
    EXPECT_EQ(told(),
              "worse   adapter 1, channel 1, enclosure 8: enclosure removed, serial number "
              "EN0101008C, Normal, state 1 (present), model HV-6, 1 fan, 2 power supplies, "
              "2 temperature sensors\n");
}

TEST_F(Changes, KnowAnEnclosureThatMovedWithItsParts) {
    Json moved = taken(adapterOf(after)["channels"][0]["enclosures"], "device_id", 8);
    moved["channel_id"] = 2;
    for (const char* const list : {"fans", "power_supplies", "temperature_sensors"}) {
        for (Json& part : moved[list]) {
            part["channel_id"] = 2;
        }
    }
    moved["fans"][0]["status"] = 1;
    adapterOf(after)["channels"][1]["enclosures"].push_back(moved);
    EXPECT_EQ(
        told(),
        "        adapter 1, channel 2, enclosure 8: enclosure moved from channel 1 "
        "enclosure 8\n"
        "worse   adapter 1, channel 2, enclosure 8, fan 0: status 0 (normal) → 1 (warning)\n");
}

TEST_F(Changes, TellThePartThatWasAddedAlone) {
    Json fan = enclosureOf(after)["fans"][0];
    fan["index"] = 2;
    enclosureOf(after)["fans"].push_back(fan);
    EXPECT_EQ(told(),
              "better  adapter 1, channel 1, enclosure 8, fan 2: fan added, status 0 (normal)\n");
}

TEST_F(Changes, KnowAnAdapterThatHasAnotherNumberWithAllThatBelongsToIt) {
    std::string text = after.dump();
    for (std::size_t at = 0; (at = text.find("\"adapter_id\":1", at)) != std::string::npos;) {
        text.replace(at, 14, "\"adapter_id\":2");
    }
    after = Json::parse(text);
    driveOf(after, 1, 3)["overall_status"] = "Critical";
    EXPECT_EQ(told(),
              "        adapter 2: adapter renumbered from adapter 1\n"
              "worse   adapter 2, channel 1, device 3: Normal → Critical\n");
}

TEST_F(Changes, KnowTheDrivesOfAnAdapterThatWasReplaced) {
    Json& adapter = adapterOf(after);
    adapter["serial_number"] = "AD009999";
    adapter["family"] = "lsi";
    adapter["adapter_type"] = "o:LSIAdapter";
    adapter.erase("unattended");
    EXPECT_EQ(told(),
              "        adapter 1: adapter replaced, serial AD001417 → AD009999, family pellion → "
              "lsi, adapter type o:PellionAdapter → o:LSIAdapter, unattended no → none\n");
}

TEST_F(Changes, TellAnAdapterOfAnUnknownType) {
    after = mixedServer();
    const std::string text = told();
    EXPECT_THAT(text,
                HasSubstr("better  adapter 5: adapter added, adapter type o:TalvikAdapter\n"
                          "better  adapter 5, channel 1: channel added, transfer speed 320 MB/s, "
                          "initiator ID 0\n"
                          "better  adapter 5, channel 1, device 0: drive added, "));
}

TEST_F(Changes, TellSpannedArraysAndWhatTheySpan) {
    after = mixedServer();
    const std::string text = told();
    EXPECT_THAT(text, HasSubstr("        adapter 1, channel 2, device 0: joined array 6\n"));
    EXPECT_THAT(text,
                HasSubstr("better  adapter 1, array 7: array added, size 350030 MB, free space "
                          "0 MB, stripe size 0 KB, in spanned array 5, misses channel 2 device 9\n"
                          "better  adapter 1, array 9: array added, in spanned array 8\n"
                          "better  adapter 1, spanned array 5: spanned array added, size "));
    EXPECT_THAT(
        text,
        HasSubstr("better  adapter 1, logical drive 2: logical drive added, Normal, "
                  "state 0 (normal), RAID level 5 (RAID 5), data space 32000 MB, in array 7, in "
                  "spanned array 5\n"));
}

TEST_F(Changes, TakeADriveAtItsAddressWhenItHasNoSerialNumber) {
    driveOf(before, 1, 3)["serial_number"] = "";
    driveOf(after, 1, 3)["serial_number"] = "  ";
    driveOf(after, 1, 3)["size"] = 1;
    EXPECT_EQ(told(),
              "        adapter 1, channel 1, device 3: serial - →   , size 70006 MB → 1 MB\n");
}

TEST_F(Changes, TakeDrivesAtTheirAddressesWhenTheySayTheSameSerialNumber) {
    for (Json* const tree : {&before, &after}) {
        for (Json& drive : drivesOf(*tree, 1)) {
            drive["serial_number"] = "0123456789";
        }
    }
    driveOf(after, 1, 2)["overall_status"] = "Critical";
    EXPECT_EQ(told(), "worse   adapter 1, channel 1, device 2: Normal → Critical\n");
}

TEST_F(Changes, CallADriveReplacedWhenOnlyOneSerialNumberIsAmbiguous) {
    driveOf(after, 1, 3)["serial_number"] = driveOf(after, 1, 2)["serial_number"];
    EXPECT_EQ(told(),
              "        adapter 1, channel 1, device 3: drive replaced, serial QS0101003K → "
              "QS0101002K\n");
}

TEST_F(Changes, AreNoneWhereOnlyPositionsAndDisplayNamesDiffer) {
    driveOf(after, 2, 1)["position"] = 17;
    driveOf(after, 1, 3)["disk_drive_name"] = "Disk Drive 7";
    enclosureOf(after)["fans"][0]["status_name"] = "Disk Drive 7";
    EXPECT_EQ(told(), "No changes\n");
}

TEST_F(Changes, TellFieldsThatThisProgramDoesNotKnow) {
    driveOf(before, 1, 3)["spin_rate"] = 10000;
    driveOf(after, 1, 3)["spin_rate"] = {{"rpm", 15000}};
    EXPECT_EQ(told(),
              "        adapter 1, channel 1, device 3: spin rate 10000 → {\"rpm\":15000}\n");
}

TEST_F(Changes, KeepControlCharactersFromTheTerminal) {
    driveOf(after, 1, 3)["model"] = "\x1b[2J\n";
    driveOf(after, 1, 3)["a\nb"] = 1;
    const std::string text = told();
    EXPECT_EQ(text,
              "        adapter 1, channel 1, device 3: model - → \\u{1b}[2J\\u{a}, "
              "a\\u{a}b none → 1\n");
}

TEST_F(Changes, AreInTheOrderOfThePlaces) {
    Json second = adapterOf(after);
    second["adapter_id"] = 10;
    adapterOf(before)["adapter_id"] = adapterOf(after)["adapter_id"] = 9;
    for (Json* const tree : {&before, &after}) {
        (*tree)["adapters"].insert((*tree)["adapters"].begin(), second);
        for (Json& adapter : (*tree)["adapters"]) {
            adapter["serial_number"] = "";
        }
    }
    for (Json& adapter : after["adapters"]) {
        adapter["type_name"] = "x";
        adapter["channels"][1]["transfer_speed"] = 1;
        adapter["arrays"][0]["size"] = 1;
    }
    const std::string text = told();
    EXPECT_THAT(text, testing::MatchesRegex("        adapter 9: [^\n]*\n"
                                            "        adapter 9, channel 2: [^\n]*\n"
                                            "        adapter 9, array 0: [^\n]*\n"
                                            "        adapter 10: [^\n]*\n"
                                            "        adapter 10, channel 2: [^\n]*\n"
                                            "        adapter 10, array 0: [^\n]*\n"));
}

TEST(Trees, AreRefusedWhereTheyHaveNotTheShapeOfOne) {
    Json noList = smallServer();
    adapterOf(noList)["channels"] = 3;
    Json noRecord = smallServer();
    drivesOf(noRecord, 1)[0] = "drive";
    Json noNumber = smallServer();
    driveOf(noNumber, 1, 3)["device_id"] = "three";
    Json noMember = smallServer();
    arrayOf(noMember)["disk_drives"][0].erase("channel_id");
    for (const Json& tree : {Json(), Json(3), Json::array(), Json::object(),
                             Json({{"adapters", 3}}), noList, noRecord, noNumber, noMember}) {
        EXPECT_THROW(static_cast<void>(changes(tree, smallServer(), codes())), SnapshotError)
            << tree;
        EXPECT_THROW(static_cast<void>(changes(smallServer(), tree, codes())), SnapshotError)
            << tree;
    }
}

}  // namespace
}  // namespace raidinfo::diff
