// Accessors with a rule of their own.

#include <gtest/gtest.h>

#include <climits>
#include <string>
#include <vector>

#include "flat/lists.h"
#include "published.h"
#include "support/fresh_library.h"
#include "support/row.h"

namespace {

using namespace raid::test;

class OddAccessors : public FreshLibrary {};

std::string adapter(std::string_view content, std::string_view type = "o:PellionAdapter") {
    return element("ac:adapter", content, type);
}

struct StatusFamily : Row {
    std::vector<std::string> around;
    std::string record;
    std::string type;
    void (*read)(char*, int);
};

const std::vector<std::string> inSystem{};
const std::vector<std::string> inChannel{"ac:adapter", "ac:physicalDrives", "ac:channel"};

const std::vector<StatusFamily> statusFamilies{
    {"PellionAdapter", inSystem, "ac:adapter", "o:MirrelAdapter",
     getPellionAdapterOverallStatusString},
    {"LSIAdapter", inSystem, "ac:adapter", "o:LSIAdapter", getLSIAdapterOverallStatusString},
    {"VantryAdapter", inSystem, "ac:adapter", "o:DorvelAdapter",
     getVantryAdapterOverallStatusString},
    {"LogicalDrive",
     {"ac:adapter", "ac:logicalDrives"},
     "ac:logicalDrive",
     "",
     getRAIDLogicalDriveOverallStatusString},
    {"DiskDrive", inChannel, "ac:hardDrive", "", getRAIDDiskDriveOverallStatusString},
    {"EnclosureDevice", inChannel, "ac:enclosure", "", getRAIDEnclosureDeviceOverallStatusString},
};

class StatusText : public FreshLibrary, public testing::WithParamInterface<StatusFamily> {};

TEST_P(StatusText, HasThreeWordsAndLeavesTheBufferAloneForAnyOtherStatus) {
    const std::vector<std::pair<int, std::string>> words{
        {0, "Normal"},     {1, "Warning"},    {2, "Critical"},        {3, "untouched"},
        {-1, "untouched"}, {99, "untouched"}, {INT_MIN, "untouched"}, {INT_MAX, "untouched"}};
    std::string records;
    for (const auto& [status, word] : words) {
        records += element(GetParam().record, element("as:overallStatus", status), GetParam().type);
    }
    publish(inside(GetParam().around, records));
    int position = 0;
    for (const auto& [status, word] : words) {
        EXPECT_EQ(written(GetParam().read, position++), word) << status;
    }
}

INSTANTIATE_TEST_SUITE_P(Families, StatusText, testing::ValuesIn(statusFamilies), nameOfRow);

struct InitiatorFamily : Row {
    std::string type;
    void (*read)(char*, int);
};

const std::vector<InitiatorFamily> initiatorFamilies{
    {"Pellion", "o:PellionAdapter", getPellionAdapterInitiatorIDs},
    {"LSI", "o:LSIAdapter", getLSIAdapterInitiatorIDs},
    {"Vantry", "o:DorvelAdapter", getVantryAdapterInitiatorIDs},
};

class InitiatorIDs : public FreshLibrary, public testing::WithParamInterface<InitiatorFamily> {
protected:
    static std::string withChannels(const std::vector<int>& initiators) {
        std::string channels;
        for (const int initiator : initiators) {
            channels += element("ac:channel", element("as:initiatorID", initiator));
        }
        return adapter(element("ac:physicalDrives", channels), GetParam().type);
    }
};

TEST_P(InitiatorIDs, AreListedChannelByChannel) {
    publish(withChannels({7, 7}) + withChannels({}) + withChannels({6}) +
            withChannels({INT_MIN, 0, INT_MAX, -1}));
    const std::vector<std::string> lists{"7,7", "", "6", "-2147483648,0,2147483647,-1"};
    for (int position = 0; position < 4; ++position) {
        EXPECT_EQ(written(GetParam().read, position), lists.at(static_cast<std::size_t>(position)));
    }
}

TEST_P(InitiatorIDs, AreEmptyOutsideTheList) {
    publish(withChannels({7, 7}));
    for (const int position : {-1, 1, INT_MIN, INT_MAX}) {
        EXPECT_EQ(written(GetParam().read, position), "");
    }
}

INSTANTIATE_TEST_SUITE_P(Families, InitiatorIDs, testing::ValuesIn(initiatorFamilies), nameOfRow);

TEST_F(OddAccessors, OfTheCacheReadPolicyGiveZeroWithoutAPosition) {
    EXPECT_EQ(getPellionAdapterCacheReadPolicy(), 0);
    publish(adapter(""));
    EXPECT_EQ(getPellionAdapterCacheReadPolicy(), 0);
}

TEST_F(OddAccessors, NameAFanAfterItsStatus) {
    publish(inside({"ac:adapter", "ac:physicalDrives", "ac:channel", "ac:enclosure", "ac:fan"},
                   element("as:status", 2)));
    EXPECT_EQ(written(getRAIDFanStatusString, 0), "Disk Drive 2");
}

TEST_F(OddAccessors, NameTheAdapterOfALogicalDriveALogicalDrive) {
    publish(
        inside({"ac:adapter", "ac:logicalDrives", "ac:logicalDrive"}, element("as:adapterID", 1)));
    EXPECT_EQ(written(getRAIDLogicalDriveAdapterIDString, 0), "Logical Drive 1");
}

TEST_F(OddAccessors, NameTheAdapterOfAnArrayARaidAdapterInEveryFamily) {
    std::string adapters;
    for (const char* const type : {"o:PellionAdapter", "o:DorvelAdapter", "o:LSIAdapter", "o:x"}) {
        adapters +=
            adapter(inside({"ac:arrays", "ac:basicArray"}, element("as:adapterID", 3)), type);
    }
    publish(adapters);
    ASSERT_EQ(getArrayCount(), 4);
    for (int position = 0; position < 4; ++position) {
        EXPECT_EQ(written(getArrayAdapterIDString, position), "RAID Adapter 3");
    }
}

TEST_F(OddAccessors, ShowNegativeAndLargestNumbersInFull) {
    publish(adapter(element("as:adapterID", INT_MIN)) + adapter(element("as:adapterID", INT_MAX)));
    EXPECT_EQ(written(getPellionAdapterAdapterIDString, 0), "Pellion Adapter -2147483648");
    EXPECT_EQ(written(getPellionAdapterAdapterIDString, 1), "Pellion Adapter 2147483647");
}

TEST_F(OddAccessors, WriteTextsOfAnyLengthUndecoded) {
    const std::string vendor = std::string(200'000, 'v') + "&amp;\xc3\xa4";
    publish(inside({"ac:adapter", "ac:physicalDrives", "ac:channel", "ac:hardDrive"},
                   element("as:vendor", vendor)));
    std::string buffer(vendor.size() + 1, '#');
    getRAIDDiskDriveVendor(buffer.data(), 0);
    EXPECT_EQ(buffer, vendor + '\0');
}

// The accessors of one kind of enclosure part, which do not differ but for their list.
struct PartFamily : Row {
    std::string part;
    int (*enclosure)(int);
    int (*channel)(int);
    int (*adapter)(int);
    int (*idString)(char*, int);
    int (*channelString)(char*, int);
    int (*adapterString)(char*, int);
    void (*number)();
};

template <auto& List>
void numberFirst() {
    List.at(0).setStructureData(3, 4, 5);
}

const std::vector<PartFamily> partFamilies{
    {"Fan", "ac:fan", getRAIDFanEnclosureID, getRAIDFanChannelID, getRAIDFanAdapterID,
     getRAIDFanFanIDString, getRAIDFanChannelIDString, getRAIDFanAdapterIDString,
     numberFirst<RAIDFanList>},
    {"PowerSupply", "ac:powerSupply", getRAIDPowerSupplyEnclosureID, getRAIDPowerSupplyChannelID,
     getRAIDPowerSupplyAdapterID, getRAIDPowerSupplyPowerSupplyIDString,
     getRAIDPowerSupplyChannelIDString, getRAIDPowerSupplyAdapterIDString,
     numberFirst<RAIDPowerSupplyList>},
    {"TempSensor", "ac:tempSensor", getRAIDTempSensorEnclosureID, getRAIDTempSensorChannelID,
     getRAIDTempSensorAdapterID, getRAIDTempSensorTempSensorIDString,
     getRAIDTempSensorChannelIDString, getRAIDTempSensorAdapterIDString,
     numberFirst<RAIDTempSensorList>},
};

class NumberedPart : public FreshLibrary, public testing::WithParamInterface<PartFamily> {};

TEST_P(NumberedPart, ShowsTheNumbersOfItsParents) {
    const auto& family = GetParam();
    publish(inside({"ac:adapter", "ac:physicalDrives", "ac:channel", "ac:enclosure", family.part},
                   element("as:status", 1)));
    family.number();
    EXPECT_EQ(family.adapter(0), 3);
    EXPECT_EQ(family.channel(0), 4);
    EXPECT_EQ(family.enclosure(0), 5);
    EXPECT_EQ(written(family.idString, 0), "Disk Drive 5");
    EXPECT_EQ(written(family.channelString, 0), "Channel 4");
    EXPECT_EQ(written(family.adapterString, 0), "Controller 3");
}

INSTANTIATE_TEST_SUITE_P(Parts, NumberedPart, testing::ValuesIn(partFamilies), nameOfRow);

}  // namespace
