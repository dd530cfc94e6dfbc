// Identifiers pushed down the tree, and the arrays that drives belong to.

#include "model/numbering.h"

#include <gtest/gtest.h>

#include <string>

#include "model/arrays.h"
#include "model/enclosures.h"

#include "support/elements.h"
#include "support/fresh_library.h"
#include "support/reading.h"

namespace {

using namespace raid::test;

class Numbering : public FreshLibrary {};

std::string drive(int device, int channel = 0) {
    return element("ac:hardDrive",
                   element("as:deviceID", device) + element("as:channelID", channel));
}

std::string channel(int id, const std::string& content) {
    return element("ac:channel", element("as:channelID", id) + content);
}

std::string logicalDrives(int id) {
    return element("ac:logicalDrives",
                   element("ac:logicalDrive", element("as:logicalDriveID", id)));
}

// An array with one member and one logical drive.
std::string basicArray(int id, const std::string& members, int logicalDrive) {
    return element("ac:basicArray", element("as:arrayID", id) +
                                        element("ac:physicalDrives", members) +
                                        logicalDrives(logicalDrive));
}

TEST_F(Numbering, GivesAChannelAndItsDrivesTheirIdentifiers) {
    auto read1 = read<RAIDChannel>(channel(1, drive(4) + drive(5) + "<ac:enclosure/>"));
    read1.setStructureData(5, 2);
    EXPECT_EQ(read1.getAdapterID(), 5);
    EXPECT_EQ(read1.getArrayID(), 2);
    for (const auto& drive : read1.getHardDrive()) {
        EXPECT_EQ(drive.getAdapterID(), 5);
        EXPECT_EQ(drive.getChannelID(), 1);
        EXPECT_EQ(drive.getArrayID(), 2);
    }
    EXPECT_EQ(read1.getEnclosureDevice()[0].getAdapterID(), 0) << "enclosures are left alone";
}

template <class Part>
void expectIn(const std::vector<Part>& parts, int adapter, int channelOfPart, int enclosure) {
    ASSERT_EQ(parts.size(), 2U);
    for (const auto& part : parts) {
        EXPECT_EQ(part.getAdapterID(), adapter);
        EXPECT_EQ(part.getChannelID(), channelOfPart);
        EXPECT_EQ(part.getEnclosureID(), enclosure);
    }
}

TEST_F(Numbering, GivesThePartsOfAnEnclosureItsIdentifiersOnceItIsAsked) {
    auto enclosure = read<RAIDEnclosureDevice>(
        "<ac:enclosure><as:adapterID>7</as:adapterID><as:channelID>2</as:channelID>"
        "<as:deviceID>15</as:deviceID><ac:fan/><ac:fan/><ac:powerSupply/><ac:powerSupply/>"
        "<ac:tempSensor/><ac:tempSensor/><ac:deviceSlotID/><ac:deviceSlotID/></ac:enclosure>");
    expectIn(enclosure.getFans(), 0, 0, 0);
    enclosure.setStructureData();
    expectIn(enclosure.getFans(), 7, 2, 15);
    expectIn(enclosure.getPowerSupplys(), 7, 2, 15);
    expectIn(enclosure.getTempSensors(), 7, 2, 15);
    expectIn(enclosure.getDeviceSlotIDs(), 7, 2, 15);
}

TEST_F(Numbering, SetsWhatItsSettersNameAndNothingElse) {
    auto logical = read<RAIDLogicalDrive>("<ac:logicalDrive/>");
    logical.setStructureData(3, 4);
    EXPECT_EQ(logical.getAdapterID(), 3);
    EXPECT_EQ(logical.getArrayID(), 4);
    logical.setArrayID(9);
    EXPECT_EQ(logical.getAdapterID(), 3);
    EXPECT_EQ(logical.getArrayID(), 9);

    auto hard = read<RAIDHardDrive>(drive(6));
    hard.setStructureData(1, 2, 3);
    hard.setArrayID(8);
    EXPECT_EQ(hard.getAdapterID(), 1);
    EXPECT_EQ(hard.getChannelID(), 2);
    EXPECT_EQ(hard.getArrayID(), 8);
    EXPECT_EQ(hard.getDeviceID(), 6);
}

TEST_F(Numbering, GivesAnArrayItsAdapterAndReachesNothingThatItHolds) {
    auto basic = read<RAIDBasicArray>(basicArray(2, channel(1, drive(4)), 3));
    basic.setStructureData(9);
    basic.setSpannedArrayIndex(6);
    EXPECT_EQ(basic.getAdapterID(), 9);
    EXPECT_EQ(basic.getSpannedArrayIndex(), 6);
    EXPECT_EQ(basic.getLogicalDrives().getLogicalDrive()[0].getAdapterID(), 0);
    EXPECT_EQ(basic.getPhysicalDrives().getChannel()[0].getArrayID(), 0);

    auto spanned = read<RAIDSpannedArray>(
        element("ac:spannedArray", element("as:arrayID", 2) + logicalDrives(3)));
    spanned.setStructureData(9);
    spanned.setSpannedArrayIndex(6);
    EXPECT_EQ(spanned.getAdapterID(), 9);
    EXPECT_EQ(spanned.getSpannedArrayIndex(), 6);
    EXPECT_EQ(spanned.getLogicalDrives().getLogicalDrive()[0].getArrayID(), -1);
}

TEST_F(Numbering, OfTheWholeSystemChangesNothingThatIsStored) {
    auto system = read<RAIDSystem>(element(
        "ac:system",
        element("ac:adapter", element("as:adapterID", 5) +
                                  element("ac:arrays", basicArray(2, channel(1, drive(4)), 3)) +
                                  element("ac:physicalDrives", channel(1, drive(4))) +
                                  logicalDrives(3) + element("ac:hotSpareDrives", drive(6)))));
    system.setStructureData();
    const auto adapter = system.getAdapters()[0];
    EXPECT_EQ(adapter.getArrays().getBasicArray()[0].getAdapterID(), 0);
    EXPECT_EQ(adapter.getPhysicaldrives()[0].getAdapterID(), 0);
    EXPECT_EQ(adapter.getPhysicaldrives()[0].getHardDrive()[0].getArrayID(), 0);
    EXPECT_EQ(adapter.getLogicaldrives()[0].getAdapterID(), 0);
    EXPECT_EQ(adapter.getHotsparedrives().getHardDrive()[0].getArrayID(), 0);
}

class ArrayMembership : public FreshLibrary {
protected:
    static RAIDAdapter adapterWith(const std::string& arrays) {
        return read<RAIDAdapter>(element("ac:adapter", element("ac:arrays", arrays)));
    }
    static RAIDHardDrive hardDrive(int ofChannel, int device) {
        return read<RAIDHardDrive>(drive(device, ofChannel));
    }
    static RAIDLogicalDrive logicalDrive(int id) {
        return read<RAIDLogicalDrive>(element("ac:logicalDrive", element("as:logicalDriveID", id)));
    }
};

TEST_F(ArrayMembership, GoesByChannelAndDevice) {
    const raid::ArrayMembers members(adapterWith(basicArray(7, channel(1, drive(4)), 3)));
    EXPECT_EQ(members.arrayOf(hardDrive(1, 4)), 7);
    EXPECT_EQ(members.arrayOf(hardDrive(1, 5)), std::nullopt);
    EXPECT_EQ(members.arrayOf(hardDrive(0, 4)), std::nullopt);
    EXPECT_EQ(members.arrayOf(hardDrive(4, 1)), std::nullopt);
    EXPECT_EQ(members.arrayOf(hardDrive(-1, 4)), std::nullopt);
    EXPECT_EQ(members.arrayOf(logicalDrive(3)), 7);
    EXPECT_EQ(members.arrayOf(logicalDrive(4)), std::nullopt);
}

TEST_F(ArrayMembership, IsThatOfTheLastArrayThatListsTheDrive) {
    const raid::ArrayMembers members(adapterWith(basicArray(7, channel(1, drive(4)), 3) +
                                                 basicArray(8, channel(1, drive(4)), 3) +
                                                 basicArray(6, channel(2, drive(4)), 2)));
    EXPECT_EQ(members.arrayOf(hardDrive(1, 4)), 8);
    EXPECT_EQ(members.arrayOf(logicalDrive(3)), 8);
}

TEST_F(ArrayMembership, DoesNotComeFromArraysInsideSpannedArrays) {
    const raid::ArrayMembers members(adapterWith(
        element("ac:spannedArray", element("ac:arrays", basicArray(7, channel(1, drive(4)), 3)))));
    EXPECT_EQ(members.arrayOf(hardDrive(1, 4)), std::nullopt);
    EXPECT_EQ(members.arrayOf(logicalDrive(3)), std::nullopt);
}

}  // namespace
