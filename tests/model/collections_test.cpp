// What the classes of the configuration do with the elements they contain.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "model/system_and_adapter.h"

#include "support/elements.h"
#include "support/fresh_library.h"
#include "support/reading.h"

namespace {

using namespace raid::test;

std::string named(const char* kind, const char* name) {
    return element(kind, element("as:name", name));
}

// One number of each item, in order.
template <class Item>
std::vector<int> numbers(const std::vector<Item>& items, int (Item::*getter)() const) {
    std::vector<int> found;
    for (const auto& item : items) {
        found.push_back((item.*getter)());
    }
    return found;
}

const std::vector<int> oneAndTwo{1, 2};

class System : public FreshLibrary {};
class Adapter : public FreshLibrary {};
class Channels : public FreshLibrary {};
class HardDrives : public FreshLibrary {};
class Enclosures : public FreshLibrary {};
class Arrays : public FreshLibrary {};
class LogicalDrives : public FreshLibrary {};

TEST_F(System, WithoutAdaptersHasAnEmptyVector) {
    EXPECT_TRUE(read<RAIDSystem>("<ac:system></ac:system>").getAdapters().empty());
}

TEST_F(System, KeepsItsAdaptersInDocumentOrder) {
    const auto adapter = [](int id) { return element("ac:adapter", element("as:adapterID", id)); };
    const auto system = read<RAIDSystem>(element("ac:system", adapter(1) + adapter(2)));
    EXPECT_EQ(numbers(system.getAdapters(), &RAIDAdapter::getAdapterID), oneAndTwo);
}

TEST_F(System, TellsItsNameAsReadSoFarInTheContextOfAnError) {
    EXPECT_EQ(errorOf<RAIDSystem>("<ac:system><as:name>host</as:name><x/></ac:system>"),
              "XML syntax error: Unknown element in   : x\nsystem:host\n");
    EXPECT_EQ(errorOf<RAIDSystem>("<ac:system><x/><as:name>host</as:name></ac:system>"),
              "XML syntax error: Unknown element in   : x\nsystem:\n");
}

TEST_F(System, AddsOneContextLineForEachElementAroundAnError) {
    EXPECT_EQ(errorOf<RAIDSystem>("<ac:system><ac:adapter><ac:physicalDrives><ac:channel>"
                                  "<as:channelID>1</as:size></ac:channel>"),
              "XML syntax error: End of \"channelID\" is missing before : as:size\n"
              "association:\n\nassociation:\n\nRAIDSystem:\n\nsystem:\n");
}

TEST_F(Adapter, WithoutTypeAttributeHasAnEmptyType) {
    EXPECT_EQ(read<RAIDAdapter>("<ac:adapter></ac:adapter>").getAdapterType(), "");
    EXPECT_EQ(read<RAIDAdapter>("<ac:adapter xsi:type='o:LSIAdapter'/>").getAdapterType(),
              "o:LSIAdapter");
}

TEST_F(Adapter, KeepsTheLastOfRepeatedCollections) {
    const auto statusOf = [](const char* collection, auto get) {
        const auto one = element(collection, element("as:overallStatus", 1));
        const auto two = element(collection, element("as:overallStatus", 2));
        return get(read<RAIDAdapter>(element("ac:adapter", one + two))).getOverallStatus();
    };
    EXPECT_EQ(statusOf("ac:arrays", [](const RAIDAdapter& a) { return a.getArrays(); }), 2);
    EXPECT_EQ(
        statusOf("ac:hotSpareDrives", [](const RAIDAdapter& a) { return a.getHotsparedrives(); }),
        2);
}

TEST_F(Adapter, HandsOutTheVectorsOfItsChannelsAndLogicalDrives) {
    const auto adapter = read<RAIDAdapter>(element(
        "ac:adapter",
        element("ac:physicalDrives", element("ac:channel", element("as:channelID", 1)) +
                                         element("ac:channel", element("as:channelID", 2))) +
            element("ac:logicalDrives",
                    element("ac:logicalDrive", element("as:logicalDriveID", 1)) +
                        element("ac:logicalDrive", element("as:logicalDriveID", 2)))));
    EXPECT_EQ(numbers(adapter.getPhysicaldrives(), &RAIDChannel::getChannelID), oneAndTwo);
    EXPECT_EQ(numbers(adapter.getLogicaldrives(), &RAIDLogicalDrive::getLogicalDriveID), oneAndTwo);
}

TEST_F(Adapter, AcceptsProgressAndLimitsAndKeepsNothingOfThem) {
    const auto adapter = read<RAIDAdapter>(
        element("ac:adapter", "<ac:progress><as:adapterID>9</as:adapterID></ac:progress>" +
                                  element("as:adapterID", 3) + "<ac:limits>x<any/></ac:limits>"));
    EXPECT_EQ(adapter.getAdapterID(), 3);
}

TEST_F(Channels, WithoutContentHaveTwoEmptyVectors) {
    const auto channel = read<RAIDChannel>("<ac:channel></ac:channel>");
    EXPECT_TRUE(channel.getHardDrive().empty());
    EXPECT_TRUE(channel.getEnclosureDevice().empty());
    EXPECT_EQ(channel.getArrayID(), 0);
}

TEST_F(Channels, KeepDrivesAndEnclosuresInDocumentOrderOfTheirKind) {
    const auto item = [](const char* kind, int id) {
        return element(kind, element("as:deviceID", id));
    };
    const auto channel = read<RAIDChannel>(
        element("ac:channel", item("ac:hardDrive", 1) + item("ac:enclosure", 1) +
                                  item("ac:hardDrive", 2) + item("ac:enclosure", 2)));
    EXPECT_EQ(numbers(channel.getHardDrive(), &RAIDHardDrive::getDeviceID), oneAndTwo);
    EXPECT_EQ(numbers(channel.getEnclosureDevice(), &RAIDEnclosureDevice::getDeviceID), oneAndTwo);
}

TEST_F(Channels, AreListedByThePhysicalDrivesAndDrivesByTheHotSpares) {
    const auto drives = read<RAIDPhysicalDrives>(
        element("ac:physicalDrives", element("ac:channel", element("as:channelID", 1)) +
                                         element("ac:channel", element("as:channelID", 2))));
    EXPECT_EQ(numbers(drives.getChannel(), &RAIDChannel::getChannelID), oneAndTwo);
    const auto spares = read<RAIDHotSpareDrives>(
        element("ac:hotSpareDrives", element("ac:hardDrive", element("as:deviceID", 1)) +
                                         element("ac:hardDrive", element("as:deviceID", 2))));
    EXPECT_EQ(numbers(spares.getHardDrive(), &RAIDHardDrive::getDeviceID), oneAndTwo);
}

TEST_F(HardDrives, TakeWriteCacheEnableAsANumberAndItsSupportAsAFlag) {
    const auto drive = read<RAIDHardDrive>(element(
        "ac:hardDrive",
        element("as:writeCacheEnable", "true") + element("as:writeCacheEnableSupported", "true")));
    EXPECT_EQ(drive.getWriteCacheEnable(), 0);
    EXPECT_EQ(drive.getWriteCacheEnableSupported(), 1);
}

TEST_F(HardDrives, KeepAFlagThatAnEmptyElementFollows) {
    const auto drive = read<RAIDHardDrive>(element(
        "ac:hardDrive", element("as:smartError", "true") + "<as:smartError></as:smartError>"));
    EXPECT_EQ(drive.getSmartError(), 1);
}

TEST_F(HardDrives, WithProgressAreReadLikeThoseWithout) {
    const auto drive = read<RAIDHardDrive>(element(
        "ac:hardDrive",
        "<ac:progress><as:percent>40</as:percent></ac:progress>" + element("as:deviceID", 4)));
    EXPECT_EQ(drive.getDeviceID(), 4);
    EXPECT_EQ(drive.getArrayID(), 0);
}

TEST_F(Enclosures, WithoutPartsHaveFourEmptyLists) {
    const auto enclosure = read<RAIDEnclosureDevice>("<ac:enclosure></ac:enclosure>");
    EXPECT_TRUE(enclosure.getFans().empty());
    EXPECT_TRUE(enclosure.getPowerSupplys().empty());
    EXPECT_TRUE(enclosure.getTempSensors().empty());
    EXPECT_TRUE(enclosure.getDeviceSlotIDs().empty());
}

TEST_F(Enclosures, KeepEachKindOfPartInDocumentOrder) {
    std::string parts;
    for (const int index : oneAndTwo) {
        for (const char* const kind :
             {"ac:fan", "ac:powerSupply", "ac:tempSensor", "ac:deviceSlotID"}) {
            parts += element(kind, element("as:index", index));
        }
    }
    const auto enclosure = read<RAIDEnclosureDevice>(element("ac:enclosure", parts));
    EXPECT_EQ(numbers(enclosure.getFans(), &RAIDFan::getIndex), oneAndTwo);
    EXPECT_EQ(numbers(enclosure.getPowerSupplys(), &RAIDPowerSupply::getIndex), oneAndTwo);
    EXPECT_EQ(numbers(enclosure.getTempSensors(), &RAIDTempSensor::getIndex), oneAndTwo);
    EXPECT_EQ(numbers(enclosure.getDeviceSlotIDs(), &RAIDDeviceSlotID::getIndex), oneAndTwo);
}

TEST_F(Enclosures, TakeTheirArrayFromTheDocument) {
    const auto enclosure =
        read<RAIDEnclosureDevice>(element("ac:enclosure", element("as:arrayID", 3)));
    EXPECT_EQ(enclosure.getArrayID(), 3);
}

TEST_F(Arrays, WithoutChildrenAreEmpty) {
    const auto arrays = read<RAIDArrays>("<ac:arrays></ac:arrays>");
    EXPECT_TRUE(arrays.getBasicArray().empty());
    EXPECT_TRUE(arrays.getSpannedArray().empty());
    EXPECT_EQ(arrays.getOverallStatus(), 0);
}

TEST_F(Arrays, KeepInterleavedKindsEachInDocumentOrder) {
    const auto array = [](const char* kind, int id) {
        return element(kind, element("as:arrayID", id));
    };
    const auto arrays = read<RAIDArrays>(
        element("ac:arrays", array("ac:spannedArray", 1) + array("ac:basicArray", 1) +
                                 array("ac:spannedArray", 2) + array("ac:basicArray", 2)));
    EXPECT_EQ(numbers(arrays.getBasicArray(), &RAIDBasicArray::getArrayID), oneAndTwo);
    EXPECT_EQ(numbers(arrays.getSpannedArray(), &RAIDSpannedArray::getArrayID), oneAndTwo);
}

TEST_F(Arrays, InsideASpannedArrayAreReachedThroughIt) {
    const auto array = read<RAIDSpannedArray>(
        element("ac:spannedArray",
                element("ac:arrays", element("ac:basicArray", element("as:arrayID", 1)) +
                                         element("ac:basicArray", element("as:arrayID", 2)))));
    EXPECT_EQ(numbers(array.getArrays().getBasicArray(), &RAIDBasicArray::getArrayID), oneAndTwo);
}

TEST_F(Arrays, StartWithASpannedArrayIndexOfMinusOne) {
    EXPECT_EQ(read<RAIDBasicArray>("<ac:basicArray/>").getSpannedArrayIndex(), -1);
    EXPECT_EQ(read<RAIDSpannedArray>("<ac:spannedArray/>").getSpannedArrayIndex(), -1);
}

TEST_F(Arrays, HoldTheirLogicalDrivesTheirChannelsAndTheirDirectMembers) {
    const auto array = read<RAIDBasicArray>(element(
        "ac:basicArray",
        element("ac:logicalDrives", named("ac:logicalDrive", "lost")) +
            element("ac:logicalDrives", named("ac:logicalDrive", "kept")) +
            element("ac:physicalDrives", element("ac:channel", element("as:channelID", 5))) +
            element("ac:hardDrive", element("as:deviceID", 1)) +
            element("ac:hardDrive", element("as:deviceID", 2))));
    ASSERT_EQ(array.getLogicalDrives().getLogicalDrive().size(), 1U);
    EXPECT_EQ(array.getLogicalDrives().getLogicalDrive()[0].getName(), "kept");
    EXPECT_EQ(numbers(array.getPhysicalDrives().getChannel(), &RAIDChannel::getChannelID),
              std::vector<int>{5});
    EXPECT_EQ(numbers(array.getHardDrives(), &RAIDHardDrive::getDeviceID), oneAndTwo);
}

TEST_F(LogicalDrives, WithoutNameAndBlockedHaveNeither) {
    const auto drive =
        read<RAIDLogicalDrive>(element("ac:logicalDrive", element("as:blocked", "false")));
    EXPECT_EQ(drive.getName(), "");
    EXPECT_EQ(drive.getBlocked(), 0);
    EXPECT_EQ(drive.getArrayID(), -1);
}

TEST_F(LogicalDrives, PassOverProgressAndKeepTheLastChunks) {
    const auto drive = read<RAIDLogicalDrive>(element(
        "ac:logicalDrive", "<ac:progress>50</ac:progress>" + element("ac:chunks", "", "o:First") +
                               element("ac:chunks", "<as:any>1</as:any>", "o:Last")));
    EXPECT_EQ(drive.getChunks().getChunksType(), "o:Last");
}

TEST_F(LogicalDrives, UnderAdapterAndArrayAreIndependent) {
    const auto drive = element("ac:logicalDrive", element("as:logicalDriveID", 1));
    const auto adapter = read<RAIDAdapter>(element(
        "ac:adapter",
        element("ac:logicalDrives", drive) +
            element("ac:arrays", element("ac:basicArray", element("ac:logicalDrives", drive)))));
    auto ofAdapter = adapter.getLogicaldrives();
    ofAdapter[0].setStructureData(4, 5);
    EXPECT_EQ(
        adapter.getArrays().getBasicArray()[0].getLogicalDrives().getLogicalDrive()[0].getArrayID(),
        -1);
    EXPECT_EQ(adapter.getLogicaldrives()[0].getArrayID(), -1) << "the getter gave a copy";
}

}  // namespace
