#include "flat/lists.h"

// One file, in this order: the lists are destroyed in the reverse order at unload, the events
// first.
std::vector<RAIDAdapter> PellionAdapterList;
std::vector<RAIDAdapter> LSIAdapterList;
std::vector<RAIDAdapter> VantryAdapterList;
std::vector<RAIDChannel> ChannelList;
std::vector<RAIDBasicArray> RAIDArrayList;
std::vector<RAIDSpannedArray> SpannedRAIDArrayList;
std::vector<RAIDLogicalDrive> RAIDLogicalDriveList;
std::vector<RAIDHardDrive> RAIDDiskDriveList;
std::vector<RAIDEnclosureDevice> RAIDEnclosureDeviceList;
std::vector<RAIDFan> RAIDFanList;
std::vector<RAIDPowerSupply> RAIDPowerSupplyList;
std::vector<RAIDTempSensor> RAIDTempSensorList;
std::vector<RAIDEvent> RAIDEventList;
