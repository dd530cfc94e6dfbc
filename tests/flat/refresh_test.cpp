// When the service is asked, and what is published when it does not answer well.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "agent/agent_link.h"
#include "flat/lists.h"
#include "flat/snapshot.h"
#include "published.h"
#include "support/fresh_library.h"
#include "support/row.h"

namespace {

using namespace raid::test;

std::string systemOf(int adapters) {
    std::string content;
    for (int id = 0; id < adapters; ++id) {
        content += element("ac:adapter", element("as:adapterID", id), "o:PellionAdapter");
    }
    return configDocument(element("ac:system", content));
}

class Refresh : public FreshLibrary {};

TEST_F(Refresh, IsDoneOnceByTheFirstCountAfterTheFlag) {
    const ScriptedService service({answering(systemOf(2))});
    setRefreshFlag();
    setRefreshFlag();
    EXPECT_EQ(refresh, 1);
    EXPECT_EQ(getChannelCount(), 0);
    EXPECT_EQ(refresh, 0);
    EXPECT_EQ(getPellionAdapterCount(), 2);
    EXPECT_EQ(service.connectionCount(), 1U);
}

TEST_F(Refresh, IsDoneForTheFlagOneOnly) {
    const ScriptedService service({});
    refresh = 2;
    EXPECT_EQ(getPellionAdapterCount(), 0);
    EXPECT_EQ(refresh, 2);
}

TEST_F(Refresh, IsNotDoneByTheAccessorsNorByTheFlagItself) {
    const ScriptedService service({});
    setRefreshFlag();
    EXPECT_EQ(getPellionAdapterAdapterID(0), 0);
    EXPECT_EQ(written(getPellionAdapterTypeName, 0), "");
    EXPECT_EQ(written(getPellionAdapterAdapterIDString, 0), "");
    EXPECT_EQ(written(getPellionAdapterOverallStatusString, 0), "untouched");
    EXPECT_EQ(written(getPellionAdapterInitiatorIDs, 0), "");
    EXPECT_EQ(getPellionAdapterCacheReadPolicy(), 0);
    EXPECT_EQ(getRAIDEventCount(), 0);
    EXPECT_EQ(refresh, 1);
}

TEST_F(Refresh, IsDoneAtOnceByTheCallsThatAskForIt) {
    const ScriptedService service({answering(systemOf(1)), answering(systemOf(3))});
    setRefreshFlag();
    EXPECT_EQ(RAIDinit(), 0);
    EXPECT_EQ(refresh, 0);
    EXPECT_EQ(getPellionAdapterCount(), 1);
    setRefreshFlag();
    EXPECT_EQ(getConfig(), 0);
    EXPECT_EQ(refresh, 0);
    EXPECT_EQ(getPellionAdapterCount(), 3);
}

TEST_F(Refresh, KeepsTheListsWhenTheAnswerIsMalformed) {
    const ScriptedService service({answering(systemOf(2)), answering(configDocument("<ac:system>")),
                                   answering("no envelope"), answering(systemOf(1))});
    RAIDinit();
    for (const char* const what : {"a malformed system", "no envelope"}) {
        setRefreshFlag();
        EXPECT_EQ(getPellionAdapterCount(), 2) << what;
        EXPECT_EQ(refresh, 0) << what;
        EXPECT_EQ(raidSystem, nullptr) << what;
    }
    setRefreshFlag();
    EXPECT_EQ(getPellionAdapterCount(), 1);
}

TEST_F(Refresh, PublishesTheOldModelAfreshWhenNoAnswerComes) {
    {
        const ScriptedService service({answering(systemOf(2))});
        RAIDinit();
    }
    PellionAdapterList.pop_back();
    setRefreshFlag();
    EXPECT_EQ(getPellionAdapterCount(), 2);
    EXPECT_EQ(refresh, 0);
}

TEST_F(Refresh, LeavesTheListsEmptyWhenThereNeverWasAnAnswer) {
    EXPECT_EQ(RAIDinit(), 0);
    setRefreshFlag();
    EXPECT_EQ(getPellionAdapterCount(), 0);
    EXPECT_EQ(refresh, 0);
    EXPECT_EQ(raidSystem, nullptr);
}

TEST_F(Refresh, NeverTouchesTheByteThatIsExportedOnly) {
    EXPECT_EQ(initialized, 0);
    publish("");
    EXPECT_EQ(initialized, 0);
}

struct Count : Row {
    int (*count)();
};

const std::vector<Count> counts{
    {"PellionAdapters", getPellionAdapterCount},
    {"LSIAdapters", getLSIAdapterCount},
    {"VantryAdapters", getVantryAdapterCount},
    {"Channels", getChannelCount},
    {"Arrays", getArrayCount},
    {"SpannedArrays", getSpannedArrayCount},
    {"LogicalDrives", getRAIDLogicalDriveCount},
    {"DiskDrives", getRAIDDiskDriveCount},
    {"EnclosureDevices", getRAIDEnclosureDeviceCount},
    {"Fans", getRAIDFanCount},
    {"PowerSupplies", getRAIDPowerSupplyCount},
    {"TempSensors", getRAIDTempSensorCount},
};

class CountOf : public FreshLibrary, public testing::WithParamInterface<Count> {};

TEST_P(CountOf, RebuildsAllListsOnceWhenARefreshIsDue) {
    const ScriptedService service({answering(systemOf(2))});
    setRefreshFlag();
    (void)GetParam().count();
    for (const Count& other : counts) {
        EXPECT_EQ(other.count(), other.count == getPellionAdapterCount ? 2 : 0) << other.name;
    }
    EXPECT_EQ(service.connectionCount(), 1U);
}

INSTANTIATE_TEST_SUITE_P(Lists, CountOf, testing::ValuesIn(counts), nameOfRow);

}  // namespace
