#pragma once

#include <vector>

#include "../model/arrays.h"
#include "../model/channels_and_drives.h"
#include "../model/enclosures.h"
#include "../model/logical_drives.h"
#include "../model/raid_events.h"
#include "../model/system_and_adapter.h"

// The published lists. Each holds its own copies of model objects, addressed by zero-based
// position. The first twelve are replaced by getConfig, the last by getEvent; nothing else writes
// them. They have no lock.

#pragma GCC visibility push(default)

extern std::vector<RAIDAdapter> PellionAdapterList;
extern std::vector<RAIDAdapter> LSIAdapterList;
extern std::vector<RAIDAdapter> VantryAdapterList;
extern std::vector<RAIDChannel> ChannelList;
extern std::vector<RAIDBasicArray> RAIDArrayList;
extern std::vector<RAIDSpannedArray> SpannedRAIDArrayList;
extern std::vector<RAIDLogicalDrive> RAIDLogicalDriveList;
extern std::vector<RAIDHardDrive> RAIDDiskDriveList;
extern std::vector<RAIDEnclosureDevice> RAIDEnclosureDeviceList;
extern std::vector<RAIDFan> RAIDFanList;
extern std::vector<RAIDPowerSupply> RAIDPowerSupplyList;
extern std::vector<RAIDTempSensor> RAIDTempSensorList;
extern std::vector<RAIDEvent> RAIDEventList;

#pragma GCC visibility pop
