#pragma once

#include <string>
#include <vector>

#include "../xml/blank.h"
#include "enclosures.h"

// An adapter's physical side. Codes and units are the service's own. All classes are plain values:
// getters return copies, and a text or a number that the document does not have stays empty or 0.
// A reading constructor takes the text at the element's start tag and its length, reports the
// bytes of the element through consumed, and throws RAIDXMLError for a malformed element.

/// ac:hardDrive
class [[gnu::visibility("default")]] RAIDHardDrive {
public:
    RAIDHardDrive(const char* text, int length, int* consumed);
    [[gnu::visibility("hidden")]] explicit RAIDHardDrive(raid::Blank) {}

    [[nodiscard]] std::string getHardDriveType() const { return hardDriveType; }
    [[nodiscard]] std::string getFirmwareLevel() const { return firmwareLevel; }
    [[nodiscard]] std::string getVendor() const { return vendor; }
    [[nodiscard]] int getType() const { return type; }
    [[nodiscard]] int getSmartError() const { return smartError; }
    [[nodiscard]] std::string getFruNumber() const { return fruNumber; }
    [[nodiscard]] int getOverallStatus() const { return overallStatus; }
    [[nodiscard]] int getState() const { return state; }
    [[nodiscard]] std::string getModel() const { return model; }
    [[nodiscard]] int getWriteCacheEnableSupported() const { return writeCacheEnableSupported; }
    [[nodiscard]] int getSize() const { return size; }
    [[nodiscard]] std::string getSerialNumber() const { return serialNumber; }
    [[nodiscard]] int getWriteCacheEnable() const { return writeCacheEnable; }
    [[nodiscard]] int getHasOSPartition() const { return hasOSPartition; }
    [[nodiscard]] int getArrayUniqueID() const { return arrayUniqueID; }
    [[nodiscard]] int getIsAssignedHotSpare() const { return isAssignedHotSpare; }
    [[nodiscard]] int getIsGlobalHotSpare() const { return isGlobalHotSpare; }
    [[nodiscard]] int getHotSpareType() const { return hotSpareType; }
    [[nodiscard]] int getDeviceID() const { return deviceID; }
    [[nodiscard]] int getAdapterID() const { return adapterID; }
    [[nodiscard]] int getChannelID() const { return channelID; }
    [[nodiscard]] int getArrayID() const { return arrayID; }

    void setArrayID(int array) { arrayID = array; }
    void setStructureData(int adapter, int channel, int array) {
        adapterID = adapter;
        channelID = channel;
        arrayID = array;
    }
    void dump() const {}

private:
    friend struct raid::xml::Vocabulary<RAIDHardDrive>;

    std::string hardDriveType;  // xsi:type
    std::string firmwareLevel;
    std::string vendor;
    int type = 0;
    int smartError = 0;
    std::string fruNumber;
    int overallStatus = 0;
    int state = 0;
    std::string model;
    int writeCacheEnableSupported = 0;
    int size = 0;
    std::string serialNumber;
    int writeCacheEnable = 0;
    int hasOSPartition = 0;
    int arrayUniqueID = 0;
    int isAssignedHotSpare = 0;
    int isGlobalHotSpare = 0;
    int hotSpareType = 0;
    int deviceID = 0;
    int adapterID = 0;
    int channelID = 0;
    int arrayID = 0;  // set by numbering only
};

/// ac:channel
class [[gnu::visibility("default")]] RAIDChannel {
public:
    RAIDChannel(const char* text, int length, int* consumed);
    [[gnu::visibility("hidden")]] explicit RAIDChannel(raid::Blank) {}

    [[nodiscard]] std::string getChannelType() const { return channelType; }
    [[nodiscard]] int getInitiatorID() const { return initiatorID; }
    [[nodiscard]] int getChannelID() const { return channelID; }
    [[nodiscard]] int getType() const { return type; }
    [[nodiscard]] int getTransferSpeed() const { return transferSpeed; }
    [[nodiscard]] int getOverallStatus() const { return overallStatus; }
    [[nodiscard]] std::vector<RAIDHardDrive> getHardDrive() const { return hardDrives; }
    [[nodiscard]] std::vector<RAIDEnclosureDevice> getEnclosureDevice() const { return enclosures; }
    [[nodiscard]] int getAdapterID() const { return adapterID; }
    [[nodiscard]] int getArrayID() const { return arrayID; }

    /// Stores both identifiers and gives them, with the channel's own, to its hard drives; the
    /// enclosures are left alone.
    void setStructureData(int adapter, int array);
    void dump() const {}

private:
    friend struct raid::xml::Vocabulary<RAIDChannel>;
    friend struct raid::Navigation;

    std::string channelType;  // xsi:type
    int initiatorID = 0;
    int channelID = 0;
    int type = 0;
    int transferSpeed = 0;
    int overallStatus = 0;
    std::vector<RAIDHardDrive> hardDrives;        // in document order
    std::vector<RAIDEnclosureDevice> enclosures;  // in document order
    int adapterID = 0;
    int arrayID = 0;  // set by numbering only
};

/// ac:physicalDrives: an adapter's channels, or the members of an array grouped by channel.
class [[gnu::visibility("default")]] RAIDPhysicalDrives {
public:
    RAIDPhysicalDrives() = default;
    RAIDPhysicalDrives(const char* text, int length, int* consumed);

    [[nodiscard]] std::string getPhysicalDrivesType() const { return physicalDrivesType; }
    [[nodiscard]] int getOverallStatus() const { return overallStatus; }
    [[nodiscard]] std::vector<RAIDChannel> getChannel() const { return channels; }
    void dump() const {}

private:
    friend struct raid::xml::Vocabulary<RAIDPhysicalDrives>;
    friend struct raid::Navigation;

    std::string physicalDrivesType;  // xsi:type
    int overallStatus = 0;
    std::vector<RAIDChannel> channels;  // in document order
};

/// ac:hotSpareDrives
class [[gnu::visibility("default")]] RAIDHotSpareDrives {
public:
    RAIDHotSpareDrives() = default;
    RAIDHotSpareDrives(const char* text, int length, int* consumed);

    [[nodiscard]] std::string getHotSpareDrivesType() const { return hotSpareDrivesType; }
    [[nodiscard]] int getOverallStatus() const { return overallStatus; }
    [[nodiscard]] std::vector<RAIDHardDrive> getHardDrive() const { return hardDrives; }
    void dump() const {}

private:
    friend struct raid::xml::Vocabulary<RAIDHotSpareDrives>;

    std::string hotSpareDrivesType;  // xsi:type
    int overallStatus = 0;
    std::vector<RAIDHardDrive> hardDrives;  // in document order
};
