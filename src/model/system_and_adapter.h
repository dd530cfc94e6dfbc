#pragma once

#include <string>
#include <vector>

#include "../xml/blank.h"
#include "arrays.h"
#include "channels_and_drives.h"
#include "logical_drives.h"

// The root of the configuration and its adapters. Codes and units are the service's own. All
// classes are plain values: getters return copies, and a text or a number that the document does
// not have stays empty or 0. A reading constructor takes the text at the element's start tag and
// its length, reports the bytes of the element through consumed, and throws RAIDXMLError for a
// malformed element.

/// ac:adapter
class [[gnu::visibility("default")]] RAIDAdapter {
public:
    RAIDAdapter(const char* text, int length, int* consumed);
    [[gnu::visibility("hidden")]] explicit RAIDAdapter(raid::Blank) {}

    /// The xsi:type as sent, for example "o:PellionAdapter".
    [[nodiscard]] std::string getAdapterType() const { return adapterType; }
    [[nodiscard]] int getHotSwapRebuild() const { return hotSwapRebuild; }
    [[nodiscard]] int getStripeUnitSize() const { return stripeUnitSize; }
    [[nodiscard]] int getBatteryStatus() const { return batteryStatus; }
    [[nodiscard]] int getCopyBack() const { return copyBack; }
    [[nodiscard]] int getSimulated() const { return simulated; }
    [[nodiscard]] int getAdapterStatus() const { return adapterStatus; }
    [[nodiscard]] int getOverallStatus() const { return overallStatus; }
    [[nodiscard]] int getPhysicalSlot() const { return physicalSlot; }
    [[nodiscard]] std::string getBiosVersion() const { return biosVersion; }
    [[nodiscard]] int getDataScrubbing() const { return dataScrubbing; }
    [[nodiscard]] int getReadAhead() const { return readAhead; }
    [[nodiscard]] std::string getFirmwareVersion() const { return firmwareVersion; }
    [[nodiscard]] int getBatteryCacheErrorCode() const { return batteryCacheErrorCode; }
    [[nodiscard]] int getRebuildRate() const { return rebuildRate; }
    [[nodiscard]] int getAdapterID() const { return adapterID; }
    [[nodiscard]] int getClustering() const { return clustering; }
    [[nodiscard]] int getUnattended() const { return unattended; }
    [[nodiscard]] int getType() const { return type; }
    [[nodiscard]] int getAdaptiveReadAhead() const { return adaptiveReadAhead; }
    [[nodiscard]] int getBatteryCacheInstalled() const { return batteryCacheInstalled; }
    [[nodiscard]] int getLimitedBIOSCompatibility() const { return limitedBIOSCompatibility; }
    [[nodiscard]] int getInstalledMemorySize() const { return installedMemorySize; }
    [[nodiscard]] int getAlarmStatus() const { return alarmStatus; }
    [[nodiscard]] std::string getTypeName() const { return typeName; }
    [[nodiscard]] int getAutoSynchronization() const { return autoSynchronization; }
    [[nodiscard]] std::string getSerialNumber() const { return serialNumber; }
    [[nodiscard]] std::string getDriverVersion() const { return driverVersion; }
    [[nodiscard]] std::string getFruNumber() const { return fruNumber; }
    [[nodiscard]] std::string getPartNumber() const { return partNumber; }
    [[nodiscard]] std::string getBatteryFruNumber() const { return batteryFruNumber; }
    [[nodiscard]] int getPciFunction() const { return pciFunction; }
    [[nodiscard]] int getPciDevice() const { return pciDevice; }
    [[nodiscard]] int getPciVendorID() const { return pciVendorID; }
    [[nodiscard]] int getPciBus() const { return pciBus; }
    [[nodiscard]] int getPciDeviceID() const { return pciDeviceID; }
    [[nodiscard]] RAIDArrays getArrays() const { return arrays; }
    [[nodiscard]] std::vector<RAIDLogicalDrive> getLogicaldrives() const {
        return logicalDrives.getLogicalDrive();
    }
    [[nodiscard]] RAIDHotSpareDrives getHotsparedrives() const { return hotSpareDrives; }
    [[nodiscard]] std::vector<RAIDChannel> getPhysicaldrives() const {
        return physicalDrives.getChannel();
    }

    void setStructureData();
    void dump() const {}

private:
    friend struct raid::xml::Vocabulary<RAIDAdapter>;
    friend struct raid::Navigation;

    std::string adapterType;  // xsi:type
    int hotSwapRebuild = 0;
    int stripeUnitSize = 0;
    int batteryStatus = 0;
    int copyBack = 0;
    int simulated = 0;
    int adapterStatus = 0;
    int overallStatus = 0;
    int physicalSlot = 0;
    std::string biosVersion;
    int dataScrubbing = 0;
    int readAhead = 0;
    std::string firmwareVersion;
    int batteryCacheErrorCode = 0;
    int rebuildRate = 0;
    int adapterID = 0;
    int clustering = 0;
    int unattended = 0;
    int type = 0;
    int adaptiveReadAhead = 0;
    int batteryCacheInstalled = 0;
    int limitedBIOSCompatibility = 0;
    int installedMemorySize = 0;
    int alarmStatus = 0;
    std::string typeName;
    int autoSynchronization = 0;
    std::string serialNumber;
    std::string driverVersion;
    std::string fruNumber;
    std::string partNumber;
    std::string batteryFruNumber;
    int pciFunction = 0;
    int pciDevice = 0;
    int pciVendorID = 0;
    int pciBus = 0;
    int pciDeviceID = 0;
    RAIDArrays arrays;
    RAIDLogicalDrives logicalDrives;
    RAIDHotSpareDrives hotSpareDrives;
    RAIDPhysicalDrives physicalDrives;
};

/// ac:system
class [[gnu::visibility("default")]] RAIDSystem {
public:
    RAIDSystem(const char* text, int length, int* consumed);

    [[nodiscard]] std::string getSystemType() const { return systemType; }
    [[nodiscard]] std::vector<RAIDAdapter> getAdapters() const { return adapters; }
    [[nodiscard]] std::string getOSVersion() const { return osVersion; }
    [[nodiscard]] std::string getOS() const { return os; }
    [[nodiscard]] int getOverallStatus() const { return overallStatus; }
    [[nodiscard]] std::string getAgentVersion() const { return agentVersion; }

    void setStructureData();
    void dump() const {}

private:
    friend struct raid::xml::Vocabulary<RAIDSystem>;
    friend struct raid::Navigation;

    std::string systemType;             // xsi:type
    std::vector<RAIDAdapter> adapters;  // in document order
    std::string osVersion;
    std::string os;
    int overallStatus = 0;
    std::string name;
    std::string agentVersion;
};
