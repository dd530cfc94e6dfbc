#include "accessor_families.h"

namespace raid::test {

namespace {

Field number(const std::string& name, const std::string& element, int fallback = 0) {
    return {name, Shape::number, element, {}, fallback};
}

Field flag(const std::string& name, const std::string& element) {
    return {name, Shape::flag, element};
}

Field text(const std::string& name, const std::string& element) {
    return {name, Shape::text, element};
}

Field display(const std::string& name, const std::string& before, const std::string& element,
              int fallback = 0) {
    return {name, Shape::displayName, element, before, fallback};
}

const Field status{"OverallStatusString", Shape::status, "as:overallStatus"};

using Fields = std::vector<Field>;

Fields operator+(Fields left, const Fields& right) {
    left.insert(left.end(), right.begin(), right.end());
    return left;
}

const Fields everyAdapter{
    number("AdapterID", "as:adapterID"),
    number("PhysicalSlot", "as:physicalSlot"),
    flag("Clustering", "as:clustering"),
    number("BatteryStatus", "as:batteryStatus"),
    text("DriverVersion", "as:driverVersion"),
    text("BatteryFruNumber", "as:batteryFruNumber"),
    text("FruNumber", "as:fruNumber"),
    text("PartNumber", "as:partNumber"),
    text("SerialNumber", "as:serialNumber"),
    text("TypeName", "as:typeName"),
    text("FirmwareVersion", "as:firmwareVersion"),
    text("BiosVersion", "as:biosVersion"),
    status,
};

const Fields rebuildingAdapter{flag("HotSwapRebuild", "as:hotSwapRebuild")};

const Fields pellionAdapter{
    number("StripeUnitSize", "as:stripeUnitSize"),
    flag("DataScrubbing", "as:dataScrubbing"),
    flag("AutoSynchronization", "as:autoSynchronization"),
    flag("Unattended", "as:unattended"),
    flag("LimitedBIOSCompatibility", "as:limitedBIOSCompatibility"),
};

Fields adapterName(const std::string& before) {
    return {display("AdapterIDString", before, "as:adapterID")};
}

const Fields everyArray{
    number("AdapterID", "as:adapterID"),
    number("SpannedArrayIndex", "", -1),
    number("Size", "as:size"),
    number("FreeSpace", "as:freeSpace"),
    number("Type", "as:type"),
    number("ArrayID", "as:arrayID"),
    number("StripeSize", "as:stripeSize"),
    display("AdapterIDString", "RAID Adapter ", "as:adapterID"),
    display("ArrayIDString", "RAID Array ", "as:arrayID"),
};

const Fields everyDevice{
    number("State", "as:state"),
    number("Type", "as:type"),
    number("ChannelID", "as:channelID"),
    number("AdapterID", "as:adapterID"),
    text("SerialNumber", "as:serialNumber"),
    text("Model", "as:model"),
    text("FruNumber", "as:fruNumber"),
    text("Vendor", "as:vendor"),
    text("FirmwareLevel", "as:firmwareLevel"),
    display("ChannelIDString", "Channel ", "as:channelID"),
    display("AdapterIDString", "Controller ", "as:adapterID"),
    status,
};

// No element of a part names its parents.
Fields partFields(const std::string& part) {
    return {
        number("Status", "as:status"),
        number("EnclosureID", ""),
        number("ChannelID", ""),
        number("AdapterID", ""),
        display("StatusString", "Disk Drive ", "as:status"),
        display(part + "IDString", "Disk Drive ", ""),
        display("ChannelIDString", "Channel ", ""),
        display("AdapterIDString", "Controller ", ""),
    };
}

const std::vector<std::string> inSystem{};
const std::vector<std::string> inArrays{"ac:adapter", "ac:arrays"};
const std::vector<std::string> inChannel{"ac:adapter", "ac:physicalDrives", "ac:channel"};
const std::vector<std::string> inEnclosure{"ac:adapter", "ac:physicalDrives", "ac:channel",
                                           "ac:enclosure"};

}  // namespace

const std::vector<AccessorFamily> accessorFamilies{
    {"PellionAdapter", inSystem, "ac:adapter", "o:PellionAdapter",
     everyAdapter + rebuildingAdapter + pellionAdapter + adapterName("Pellion Adapter ")},
    {"LSIAdapter", inSystem, "ac:adapter", "o:LSIAdapter",
     everyAdapter + rebuildingAdapter + adapterName("LSI Adapter ")},
    {"VantryAdapter", inSystem, "ac:adapter", "o:DorvelAdapter",
     everyAdapter + adapterName("Vantry Adapter ")},
    {"Channel",
     {"ac:adapter", "ac:physicalDrives"},
     "ac:channel",
     "",
     {
         number("AdapterID", "as:adapterID"),
         number("TransferSpeed", "as:transferSpeed"),
         number("Type", "as:type"),
         number("ChannelID", "as:channelID"),
         number("InitiatorID", "as:initiatorID"),
         display("AdapterIDString", "Controller ", "as:adapterID"),
         display("ChannelIDString", "SCSI Channel ", "as:channelID"),
     }},
    {"Array", inArrays, "ac:basicArray", "", everyArray},
    {"SpannedArray", inArrays, "ac:spannedArray", "", everyArray},
    {"RAIDLogicalDrive",
     {"ac:adapter", "ac:logicalDrives"},
     "ac:logicalDrive",
     "",
     {
         number("State", "as:state"),
         flag("Shared", "as:shared"),
         number("ParitySpace", "as:paritySpace"),
         number("DataSpace", "as:dataSpace"),
         number("ArrayID", "", -1),
         number("AdapterID", "as:adapterID"),
         number("LogicalDriveID", "as:logicalDriveID"),
         number("RaidLevel", "as:raidLevel"),
         number("WriteCacheMode", "as:writeCacheMode"),
         flag("Blocked", "as:blocked"),
         number("StripeUnitSize", "as:stripeUnitSize"),
         number("Type", "as:type"),
         display("ArrayIDString", "Logical Drive ", "", -1),
         display("AdapterIDString", "Logical Drive ", "as:adapterID"),
         display("LogicalDriveIDString", "Logical Drive ", "as:logicalDriveID"),
         status,
     }},
    {"RAIDDiskDrive", inChannel, "ac:hardDrive", "",
     everyDevice +
         Fields{
             number("ArrayID", ""),
             number("ArrayUniqueID", "as:arrayUniqueID"),
             flag("HasOSPartition", "as:hasOSPartition"),
             number("Size", "as:size"),
             number("WriteCacheEnable", "as:writeCacheEnable"),
             flag("WriteCachEnableSupported", "as:writeCacheEnableSupported"),
             flag("SmartError", "as:smartError"),
             display("DiskDriveIDString", "Disk Drive ", "as:arrayUniqueID"),
         }},
    {"RAIDEnclosureDevice", inChannel, "ac:enclosure", "",
     everyDevice +
         Fields{
             number("ArrayID", "as:arrayID"),
             number("DeviceID", "as:deviceID"),
             number("LogicalID", "as:logicalID"),
             text("EnclosureDeviceType", "xsi:type"),
             display("EnclosureDeviceIDString", "Disk Drive ", "as:deviceID"),
         }},
    {"RAIDFan", inEnclosure, "ac:fan", "", partFields("Fan")},
    {"RAIDPowerSupply", inEnclosure, "ac:powerSupply", "", partFields("PowerSupply")},
    {"RAIDTempSensor", inEnclosure, "ac:tempSensor", "", partFields("TempSensor")},
};

}  // namespace raid::test
