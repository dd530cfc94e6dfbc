#include "classes.h"

#include "model/arrays.h"
#include "model/channels_and_drives.h"
#include "model/describe.h"
#include "model/enclosures.h"
#include "model/logical_drives.h"
#include "model/system_and_adapter.h"

namespace raid::test {

std::string ModelClass::missing(std::string_view word, std::string_view found) const {
    return std::string("XML syntax error: End of \"")
        .append(word)
        .append("\" is missing before : ")
        .append(found)
        .append(context);
}

std::string ModelClass::unknown(std::string_view found) const {
    return std::string("XML syntax error: Unknown element in   : ").append(found).append(context);
}

const std::vector<ModelClass>& passedClasses() {
    static const std::vector<ModelClass> classes{
        Describe<RAIDChunks>("RAIDChunks", "ac:chunks", "chunks", &RAIDChunks::getChunksType),
        // These two keep nothing that can be asked for.
        Describe<RAIDLimits>("RAIDLimits", "ac:limits", "limits", nullptr),
        Describe<RAIDProgress>("RAIDProgress", "ac:progress", "progress", nullptr),
    };
    return classes;
}

const std::vector<ModelClass>& modelClasses() {
    (void)passedClasses();  // logical drives show their chunks
    static const std::vector<ModelClass> classes{
        Describe<RAIDLogicalDrive>("RAIDLogicalDrive", "ac:logicalDrive", "logicalDrive",
                                   &RAIDLogicalDrive::getLogicalDriveType)
            .number("overallStatus", &RAIDLogicalDrive::getOverallStatus)
            .number("type", &RAIDLogicalDrive::getType)
            .number("stripeUnitSize", &RAIDLogicalDrive::getStripeUnitSize)
            .flag("blocked", &RAIDLogicalDrive::getBlocked)
            .number("writeCacheMode", &RAIDLogicalDrive::getWriteCacheMode)
            .number("raidLevel", &RAIDLogicalDrive::getRaidLevel)
            .number("logicalDriveID", &RAIDLogicalDrive::getLogicalDriveID)
            .number("dataSpace", &RAIDLogicalDrive::getDataSpace)
            .number("paritySpace", &RAIDLogicalDrive::getParitySpace)
            .flag("shared", &RAIDLogicalDrive::getShared)
            .number("state", &RAIDLogicalDrive::getState)
            .number("r5eeSubstate", &RAIDLogicalDrive::getR5eeSubstate)
            .text("name", &RAIDLogicalDrive::getName)
            .number("readCacheMode", &RAIDLogicalDrive::getReadCacheMode)
            .number("adapterID", &RAIDLogicalDrive::getAdapterID)
            .number("logicalID", &RAIDLogicalDrive::getLogicalID)
            .one("ac:chunks", &RAIDLogicalDrive::getChunks)
            .knows("ac:progress"),
        Describe<RAIDLogicalDrives>("RAIDLogicalDrives", "ac:logicalDrives", "logicalDrives",
                                    &RAIDLogicalDrives::getLogicalDrivesType)
            .number("overallStatus", &RAIDLogicalDrives::getOverallStatus)
            .each({"ac:logicalDrive"}, &RAIDLogicalDrives::getLogicalDrive),
        Describe<RAIDFan>("RAIDFan", "ac:fan", "Fan", &RAIDFan::getFanType)
            .number("index", &RAIDFan::getIndex)
            .number("status", &RAIDFan::getStatus),
        Describe<RAIDPowerSupply>("RAIDPowerSupply", "ac:powerSupply", "PowerSupply",
                                  &RAIDPowerSupply::getPowerSupplyType)
            .number("index", &RAIDPowerSupply::getIndex)
            .number("status", &RAIDPowerSupply::getStatus),
        Describe<RAIDTempSensor>("RAIDTempSensor", "ac:tempSensor", "TempSensor",
                                 &RAIDTempSensor::getTempSensorType)
            .number("index", &RAIDTempSensor::getIndex)
            .number("status", &RAIDTempSensor::getStatus),
        Describe<RAIDDeviceSlotID>("RAIDDeviceSlotID", "ac:deviceSlotID", "DeviceSlotID",
                                   &RAIDDeviceSlotID::getDeviceSlotIDType)
            .number("index", &RAIDDeviceSlotID::getIndex)
            .number("slotID", &RAIDDeviceSlotID::getSlotID),
        Describe<RAIDEnclosureDevice>("RAIDEnclosureDevice", "ac:enclosure", "EnclosureDevice",
                                      &RAIDEnclosureDevice::getEnclosureDeviceType)
            .number("adapterID", &RAIDEnclosureDevice::getAdapterID)
            .number("logicalID", &RAIDEnclosureDevice::getLogicalID)
            .number("channelID", &RAIDEnclosureDevice::getChannelID)
            .text("firmwareLevel", &RAIDEnclosureDevice::getFirmwareLevel)
            .text("vendor", &RAIDEnclosureDevice::getVendor)
            .number("type", &RAIDEnclosureDevice::getType)
            .number("deviceID", &RAIDEnclosureDevice::getDeviceID)
            .number("arrayID", &RAIDEnclosureDevice::getArrayID)
            .text("fruNumber", &RAIDEnclosureDevice::getFruNumber)
            .number("overallStatus", &RAIDEnclosureDevice::getOverallStatus)
            .number("state", &RAIDEnclosureDevice::getState)
            .text("model", &RAIDEnclosureDevice::getModel)
            .text("serialNumber", &RAIDEnclosureDevice::getSerialNumber)
            .text("interfaceType", &RAIDEnclosureDevice::getInterfaceType)
            .each({"ac:fan"}, &RAIDEnclosureDevice::getFans)
            .each({"ac:powerSupply"}, &RAIDEnclosureDevice::getPowerSupplys)
            .each({"ac:tempSensor"}, &RAIDEnclosureDevice::getTempSensors)
            .each({"ac:deviceSlotID"}, &RAIDEnclosureDevice::getDeviceSlotIDs),
        Describe<RAIDHardDrive>("RAIDHardDrive", "ac:hardDrive", "HardDrive",
                                &RAIDHardDrive::getHardDriveType)
            .text("firmwareLevel", &RAIDHardDrive::getFirmwareLevel)
            .text("vendor", &RAIDHardDrive::getVendor)
            .number("type", &RAIDHardDrive::getType)
            .flag("smartError", &RAIDHardDrive::getSmartError)
            .text("fruNumber", &RAIDHardDrive::getFruNumber)
            .number("overallStatus", &RAIDHardDrive::getOverallStatus)
            .number("state", &RAIDHardDrive::getState)
            .text("model", &RAIDHardDrive::getModel)
            .flag("writeCacheEnableSupported", &RAIDHardDrive::getWriteCacheEnableSupported)
            .number("size", &RAIDHardDrive::getSize)
            .text("serialNumber", &RAIDHardDrive::getSerialNumber)
            .number("writeCacheEnable", &RAIDHardDrive::getWriteCacheEnable)
            .flag("hasOSPartition", &RAIDHardDrive::getHasOSPartition)
            .number("arrayUniqueID", &RAIDHardDrive::getArrayUniqueID)
            .flag("isAssignedHotSpare", &RAIDHardDrive::getIsAssignedHotSpare)
            .flag("isGlobalHotSpare", &RAIDHardDrive::getIsGlobalHotSpare)
            .number("hotSpareType", &RAIDHardDrive::getHotSpareType)
            .number("deviceID", &RAIDHardDrive::getDeviceID)
            .number("adapterID", &RAIDHardDrive::getAdapterID)
            .number("channelID", &RAIDHardDrive::getChannelID)
            .knows("ac:progress"),
        Describe<RAIDChannel>("RAIDChannel", "ac:channel", "channel", &RAIDChannel::getChannelType)
            .number("initiatorID", &RAIDChannel::getInitiatorID)
            .number("channelID", &RAIDChannel::getChannelID)
            .number("type", &RAIDChannel::getType)
            .number("transferSpeed", &RAIDChannel::getTransferSpeed)
            .number("overallStatus", &RAIDChannel::getOverallStatus)
            .number("adapterID", &RAIDChannel::getAdapterID)
            .each({"ac:hardDrive"}, &RAIDChannel::getHardDrive)
            .each({"ac:enclosure"}, &RAIDChannel::getEnclosureDevice),
        Describe<RAIDPhysicalDrives>("RAIDPhysicalDrives", "ac:physicalDrives", "physicalDrives",
                                     &RAIDPhysicalDrives::getPhysicalDrivesType)
            .number("overallStatus", &RAIDPhysicalDrives::getOverallStatus)
            .each({"ac:channel"}, &RAIDPhysicalDrives::getChannel),
        Describe<RAIDHotSpareDrives>("RAIDHotSpareDrives", "ac:hotSpareDrives", "HotSpareDrives",
                                     &RAIDHotSpareDrives::getHotSpareDrivesType)
            .number("overallStatus", &RAIDHotSpareDrives::getOverallStatus)
            .each({"ac:hardDrive"}, &RAIDHotSpareDrives::getHardDrive),
        Describe<RAIDArrays>("RAIDArrays", "ac:arrays", "arrays", &RAIDArrays::getArraysType)
            .number("overallStatus", &RAIDArrays::getOverallStatus)
            .each({"ac:basicArray"}, &RAIDArrays::getBasicArray)
            .each({"ac:spannedArray"}, &RAIDArrays::getSpannedArray),
        Describe<RAIDBasicArray>("RAIDBasicArray", "ac:basicArray", "basicArray",
                                 &RAIDBasicArray::getBasicArrayType)
            .flag("isSubArray", &RAIDBasicArray::getIsSubArray)
            .number("type", &RAIDBasicArray::getType)
            .number("stripeSize", &RAIDBasicArray::getStripeSize)
            .number("overallStatus", &RAIDBasicArray::getOverallStatus)
            .number("freeSpace", &RAIDBasicArray::getFreeSpace)
            .text("preferredOwner", &RAIDBasicArray::getPreferredOwner)
            .number("size", &RAIDBasicArray::getSize)
            .text("name", &RAIDBasicArray::getName)
            .number("arrayID", &RAIDBasicArray::getArrayID)
            .number("adapterID", &RAIDBasicArray::getAdapterID)
            .one("ac:logicalDrives", &RAIDBasicArray::getLogicalDrives)
            .one("ac:physicalDrives", &RAIDBasicArray::getPhysicalDrives)
            .each({"ac:hardDrive"}, &RAIDBasicArray::getHardDrives)
            .exitsAs("RAIDSystem"),
        Describe<RAIDSpannedArray>("RAIDSpannedArray", "ac:spannedArray", "spannedArray",
                                   &RAIDSpannedArray::getSpannedArrayType)
            .number("type", &RAIDSpannedArray::getType)
            .number("stripeSize", &RAIDSpannedArray::getStripeSize)
            .number("overallStatus", &RAIDSpannedArray::getOverallStatus)
            .number("freeSpace", &RAIDSpannedArray::getFreeSpace)
            .text("preferredOwner", &RAIDSpannedArray::getPreferredOwner)
            .number("size", &RAIDSpannedArray::getSize)
            .text("name", &RAIDSpannedArray::getName)
            .number("arrayID", &RAIDSpannedArray::getArrayID)
            .number("adapterID", &RAIDSpannedArray::getAdapterID)
            .one("ac:logicalDrives", &RAIDSpannedArray::getLogicalDrives)
            .one("ac:arrays", &RAIDSpannedArray::getArrays)
            .exitsAs("RAIDSystem"),
        Describe<RAIDAdapter>("RAIDAdapter", "ac:adapter", "adapter", &RAIDAdapter::getAdapterType)
            .flag("hotSwapRebuild", &RAIDAdapter::getHotSwapRebuild)
            .number("stripeUnitSize", &RAIDAdapter::getStripeUnitSize)
            .number("batteryStatus", &RAIDAdapter::getBatteryStatus)
            .flag("copyBack", &RAIDAdapter::getCopyBack)
            .flag("simulated", &RAIDAdapter::getSimulated)
            .number("adapterStatus", &RAIDAdapter::getAdapterStatus)
            .number("overallStatus", &RAIDAdapter::getOverallStatus)
            .number("physicalSlot", &RAIDAdapter::getPhysicalSlot)
            .text("biosVersion", &RAIDAdapter::getBiosVersion)
            .flag("dataScrubbing", &RAIDAdapter::getDataScrubbing)
            .flag("readAhead", &RAIDAdapter::getReadAhead)
            .text("firmwareVersion", &RAIDAdapter::getFirmwareVersion)
            .number("batteryCacheErrorCode", &RAIDAdapter::getBatteryCacheErrorCode)
            .number("rebuildRate", &RAIDAdapter::getRebuildRate)
            .number("adapterID", &RAIDAdapter::getAdapterID)
            .flag("clustering", &RAIDAdapter::getClustering)
            .flag("unattended", &RAIDAdapter::getUnattended)
            .number("type", &RAIDAdapter::getType)
            .flag("adaptiveReadAhead", &RAIDAdapter::getAdaptiveReadAhead)
            .flag("batteryCacheInstalled", &RAIDAdapter::getBatteryCacheInstalled)
            .flag("limitedBIOSCompatibility", &RAIDAdapter::getLimitedBIOSCompatibility)
            .number("installedMemorySize", &RAIDAdapter::getInstalledMemorySize)
            .number("alarmStatus", &RAIDAdapter::getAlarmStatus)
            .text("typeName", &RAIDAdapter::getTypeName)
            .flag("autoSynchronization", &RAIDAdapter::getAutoSynchronization)
            .text("serialNumber", &RAIDAdapter::getSerialNumber)
            .text("driverVersion", &RAIDAdapter::getDriverVersion)
            .text("fruNumber", &RAIDAdapter::getFruNumber)
            .text("partNumber", &RAIDAdapter::getPartNumber)
            .text("batteryFruNumber", &RAIDAdapter::getBatteryFruNumber)
            .number("pciFunction", &RAIDAdapter::getPciFunction)
            .number("pciDevice", &RAIDAdapter::getPciDevice)
            .number("pciVendorID", &RAIDAdapter::getPciVendorID)
            .number("pciBus", &RAIDAdapter::getPciBus)
            .number("pciDeviceID", &RAIDAdapter::getPciDeviceID)
            .one("ac:arrays", &RAIDAdapter::getArrays)
            .each({"ac:logicalDrives", "ac:logicalDrive"}, &RAIDAdapter::getLogicaldrives)
            .one("ac:hotSpareDrives", &RAIDAdapter::getHotsparedrives)
            .each({"ac:physicalDrives", "ac:channel"}, &RAIDAdapter::getPhysicaldrives)
            .knows("ac:progress")
            .knows("ac:limits")
            .endWordOf("alarmStatus", "as:alarmStatus")
            .exitsAs("RAIDSystem")
            .inContext("\nRAIDSystem:\n"),
        Describe<RAIDSystem>("RAIDSystem", "ac:system", "system", &RAIDSystem::getSystemType)
            .text("osVersion", &RAIDSystem::getOSVersion)
            .text("os", &RAIDSystem::getOS)
            .number("overallStatus", &RAIDSystem::getOverallStatus)
            .text("agentVersion", &RAIDSystem::getAgentVersion)
            .each({"ac:adapter"}, &RAIDSystem::getAdapters)
            .knows("as:name")
            .inContext("\nsystem:\n"),
    };
    return classes;
}

}  // namespace raid::test
