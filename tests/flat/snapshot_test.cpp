// What is published, and in which order.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "agent/agent_link.h"
#include "flat/lists.h"
#include "flat/snapshot.h"
#include "published.h"
#include "support/fresh_library.h"

namespace {

using namespace raid::test;

using Numbers = std::vector<int>;

class Snapshot : public FreshLibrary {};

std::string adapter(int id, std::string_view type, std::string_view content = {}) {
    return element("ac:adapter", element("as:adapterID", id).append(content), type);
}

// The counts of the twelve lists.
Numbers counts() {
    return {getPellionAdapterCount(),   getLSIAdapterCount(),      getVantryAdapterCount(),
            getChannelCount(),          getArrayCount(),           getSpannedArrayCount(),
            getRAIDLogicalDriveCount(), getRAIDDiskDriveCount(),   getRAIDEnclosureDeviceCount(),
            getRAIDFanCount(),          getRAIDPowerSupplyCount(), getRAIDTempSensorCount()};
}

std::string part(const std::string& name, int status) {
    return element(name, element("as:status", status));
}

// Everything that an adapter can hold, numbered from `first` in the order of publication.
std::string full(int first) {
    const auto enclosure = [](int id) {
        return element("ac:enclosure",
                       part("ac:tempSensor", id + 40) + part("ac:fan", id + 20) +
                           element("as:deviceID", id) + part("ac:powerSupply", id + 30) +
                           part("ac:fan", id + 21) + part("ac:powerSupply", id + 31) +
                           part("ac:tempSensor", id + 41));
    };
    const auto drive = [](int id) {
        return element("ac:hardDrive", element("as:arrayUniqueID", id));
    };
    const auto channel = [&](int id) {
        return element("ac:channel", enclosure(id) + drive(id) + element("as:channelID", id) +
                                         drive(id + 1) + enclosure(id + 1));
    };
    const auto array = [](int id) { return element("ac:basicArray", element("as:arrayID", id)); };
    const auto spanned = [&](int id, const std::string& arrays) {
        return element("ac:spannedArray", element("as:arrayID", id) + element("ac:arrays", arrays));
    };
    const auto logical = [](int id) {
        return element("ac:logicalDrive", element("as:logicalDriveID", id));
    };
    return element("ac:arrays",
                   spanned(first + 1, array(first + 3) + array(first + 4)) + array(first + 1) +
                       spanned(first + 2, array(first + 5) + spanned(first + 9, array(first + 9))) +
                       array(first + 2)) +
           element("ac:logicalDrives", logical(first + 1) + logical(first + 2)) +
           element("ac:physicalDrives", channel(first + 1) + channel(first + 3));
}

TEST_F(Snapshot, HoldsEveryListInTheOrderOfTheConfiguration) {
    publish(adapter(1, "o:PellionAdapter", full(100)) + adapter(2, "o:DorvelAdapter", full(200)));
    EXPECT_EQ(all(getChannelCount, getChannelChannelID), (Numbers{101, 103, 201, 203}));
    EXPECT_EQ(all(getRAIDDiskDriveCount, getRAIDDiskDriveArrayUniqueID),
              (Numbers{101, 102, 103, 104, 201, 202, 203, 204}));
    EXPECT_EQ(all(getRAIDEnclosureDeviceCount, getRAIDEnclosureDeviceDeviceID),
              (Numbers{101, 102, 103, 104, 201, 202, 203, 204}));
    EXPECT_EQ(
        all(getRAIDFanCount, getRAIDFanStatus),
        (Numbers{121, 122, 122, 123, 123, 124, 124, 125, 221, 222, 222, 223, 223, 224, 224, 225}));
    EXPECT_EQ(
        all(getRAIDPowerSupplyCount, getRAIDPowerSupplyStatus),
        (Numbers{131, 132, 132, 133, 133, 134, 134, 135, 231, 232, 232, 233, 233, 234, 234, 235}));
    EXPECT_EQ(
        all(getRAIDTempSensorCount, getRAIDTempSensorStatus),
        (Numbers{141, 142, 142, 143, 143, 144, 144, 145, 241, 242, 242, 243, 243, 244, 244, 245}));
    EXPECT_EQ(all(getRAIDLogicalDriveCount, getRAIDLogicalDriveLogicalDriveID),
              (Numbers{101, 102, 201, 202}));
    // What lies deeper than inside one spanned array is not published.
    EXPECT_EQ(all(getArrayCount, getArrayArrayID),
              (Numbers{101, 102, 103, 104, 105, 201, 202, 203, 204, 205}));
    EXPECT_EQ(all(getSpannedArrayCount, getSpannedArrayArrayID), (Numbers{101, 102, 201, 202}));
}

TEST_F(Snapshot, SortsAdaptersIntoFamiliesByTheirExactType) {
    publish(adapter(1, "o:PellionAdapter") + adapter(2, "o:LSIAdapter") +
            adapter(3, "o:MirrelAdapter") + adapter(4, "o:DorvelAdapter") +
            adapter(5, "o:PellionAdapter") + adapter(6, "o:pellionadapter") +
            adapter(7, "PellionAdapter") + adapter(8, "") + adapter(9, "o:LSIAdapter2") +
            adapter(10, "o:LSIAdapter"));
    EXPECT_EQ(all(getPellionAdapterCount, getPellionAdapterAdapterID), (Numbers{1, 3, 5}));
    EXPECT_EQ(all(getLSIAdapterCount, getLSIAdapterAdapterID), (Numbers{2, 10}));
    EXPECT_EQ(all(getVantryAdapterCount, getVantryAdapterAdapterID), (Numbers{4}));
}

TEST_F(Snapshot, PublishesWhatBelongsToAnAdapterOfAnUnknownType) {
    publish(adapter(1, "o:SomethingElse", full(100)));
    EXPECT_EQ(counts(), (Numbers{0, 0, 0, 2, 5, 2, 2, 4, 4, 8, 8, 8}));
}

TEST_F(Snapshot, OfASystemWithoutAdaptersIsEmpty) {
    publish(adapter(1, "o:PellionAdapter", full(100)) + adapter(2, "o:LSIAdapter") +
            adapter(3, "o:DorvelAdapter"));
    EXPECT_EQ(counts(), (Numbers{1, 1, 1, 2, 5, 2, 2, 4, 4, 8, 8, 8}));
    publish("");
    EXPECT_EQ(counts(), Numbers(12, 0));
}

TEST_F(Snapshot, PutsTheArraysOfSpannedArraysBehindTheAdaptersOwn) {
    publish(adapter(1, "o:PellionAdapter",
                    "<ac:arrays><ac:spannedArray><ac:arrays><ac:basicArray>"
                    "<as:arrayID>2</as:arrayID></ac:basicArray></ac:arrays></ac:spannedArray>"
                    "<ac:basicArray><as:arrayID>1</as:arrayID></ac:basicArray></ac:arrays>"));
    EXPECT_EQ(all(getArrayCount, getArrayArrayID), (Numbers{1, 2}));
}

TEST_F(Snapshot, GivesEveryArrayTheSpannedArrayIndexMinusOne) {
    publish(adapter(1, "o:PellionAdapter", full(100)) + adapter(2, "o:LSIAdapter", full(200)));
    EXPECT_EQ(all(getArrayCount, getArraySpannedArrayIndex), Numbers(10, -1));
    EXPECT_EQ(all(getSpannedArrayCount, getSpannedArraySpannedArrayIndex), Numbers(4, -1));
}

TEST_F(Snapshot, HoldsWholeCopiesThatOutliveTheModel) {
    publish(adapter(1, "o:PellionAdapter", full(100)));
    processXML(static_cast<char*>(std::calloc(1, 1)), 0);
    ASSERT_EQ(raidSystem, nullptr);
    EXPECT_EQ(counts(), (Numbers{1, 0, 0, 2, 5, 2, 2, 4, 4, 8, 8, 8}));
    EXPECT_EQ(PellionAdapterList.at(0).getPhysicaldrives().size(), 2U);
    EXPECT_EQ(PellionAdapterList.at(0).getArrays().getSpannedArray().size(), 2U);
    EXPECT_EQ(ChannelList.at(1).getHardDrive().size(), 2U);
    EXPECT_EQ(RAIDEnclosureDeviceList.at(0).getFans().size(), 2U);
}

TEST_F(Snapshot, LeavesTheEventsAlone) {
    RAIDEventList.resize(3);
    publish(adapter(1, "o:PellionAdapter"));
    publish("");
    EXPECT_EQ(getRAIDEventCount(), 3);
}

TEST_F(Snapshot, ReturnsZeroAndAnIndexUnchanged) {
    EXPECT_EQ(RAIDinit(), 0);
    EXPECT_EQ(getConfig(), 0);
    for (const int index : {5, 0, -1}) {
        EXPECT_EQ(getPellionIndex(index), index);
    }
}

}  // namespace
