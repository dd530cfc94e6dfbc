#pragma once

#include <tuple>

#include "flat/lists.h"

namespace raid::test {

// The twelve lists that a refresh rebuilds.
inline auto inventoryLists() {
    return std::tie(PellionAdapterList, LSIAdapterList, VantryAdapterList, ChannelList,
                    RAIDArrayList, SpannedRAIDArrayList, RAIDLogicalDriveList, RAIDDiskDriveList,
                    RAIDEnclosureDeviceList, RAIDFanList, RAIDPowerSupplyList, RAIDTempSensorList);
}

template <class Action>
void forEachInventoryList(Action action) {
    std::apply([&](auto&... lists) { (action(lists), ...); }, inventoryLists());
}

}  // namespace raid::test
