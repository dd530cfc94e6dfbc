#pragma once

#include <tuple>

#include "flat/lists.h"

namespace raid::bench {

/// The twelve lists that are published of a configuration.
inline auto publishedLists() {
    return std::tie(PellionAdapterList, LSIAdapterList, VantryAdapterList, ChannelList,
                    RAIDArrayList, SpannedRAIDArrayList, RAIDLogicalDriveList, RAIDDiskDriveList,
                    RAIDEnclosureDeviceList, RAIDFanList, RAIDPowerSupplyList, RAIDTempSensorList);
}

}  // namespace raid::bench
