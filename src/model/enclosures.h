#pragma once

#include <string>
#include <vector>

#include "../xml/blank.h"

// An enclosure on a channel and its parts. Codes are the service's own. All classes are plain
// values: getters return copies, and a text or a number that the document does not have stays
// empty or 0. A reading constructor takes the text at the element's start tag and its length,
// reports the bytes of the element through consumed, and throws RAIDXMLError for a malformed
// element. The three identifiers of a part are not in the document; they are set from its
// enclosure, whose deviceID is the part's enclosureID.

/// ac:fan
class [[gnu::visibility("default")]] RAIDFan {
public:
    RAIDFan() = default;
    RAIDFan(const char* text, int length, int* consumed);

    [[nodiscard]] std::string getFanType() const { return fanType; }
    [[nodiscard]] int getIndex() const { return index; }
    [[nodiscard]] int getStatus() const { return status; }
    [[nodiscard]] int getAdapterID() const { return adapterID; }
    [[nodiscard]] int getChannelID() const { return channelID; }
    [[nodiscard]] int getEnclosureID() const { return enclosureID; }
    void setStructureData(int adapter, int channel, int enclosure) {
        adapterID = adapter;
        channelID = channel;
        enclosureID = enclosure;
    }

private:
    friend struct raid::xml::Vocabulary<RAIDFan>;

    std::string fanType;  // xsi:type
    int index = 0;
    int status = 0;
    int adapterID = 0;
    int channelID = 0;
    int enclosureID = 0;
};

/// ac:powerSupply
class [[gnu::visibility("default")]] RAIDPowerSupply {
public:
    RAIDPowerSupply() = default;
    RAIDPowerSupply(const char* text, int length, int* consumed);

    [[nodiscard]] std::string getPowerSupplyType() const { return powerSupplyType; }
    [[nodiscard]] int getIndex() const { return index; }
    [[nodiscard]] int getStatus() const { return status; }
    [[nodiscard]] int getAdapterID() const { return adapterID; }
    [[nodiscard]] int getChannelID() const { return channelID; }
    [[nodiscard]] int getEnclosureID() const { return enclosureID; }
    void setStructureData(int adapter, int channel, int enclosure) {
        adapterID = adapter;
        channelID = channel;
        enclosureID = enclosure;
    }

private:
    friend struct raid::xml::Vocabulary<RAIDPowerSupply>;

    std::string powerSupplyType;  // xsi:type
    int index = 0;
    int status = 0;
    int adapterID = 0;
    int channelID = 0;
    int enclosureID = 0;
};

/// ac:tempSensor
class [[gnu::visibility("default")]] RAIDTempSensor {
public:
    RAIDTempSensor() = default;
    RAIDTempSensor(const char* text, int length, int* consumed);

    [[nodiscard]] std::string getTempSensorType() const { return tempSensorType; }
    [[nodiscard]] int getIndex() const { return index; }
    [[nodiscard]] int getStatus() const { return status; }
    [[nodiscard]] int getAdapterID() const { return adapterID; }
    [[nodiscard]] int getChannelID() const { return channelID; }
    [[nodiscard]] int getEnclosureID() const { return enclosureID; }
    void setStructureData(int adapter, int channel, int enclosure) {
        adapterID = adapter;
        channelID = channel;
        enclosureID = enclosure;
    }

private:
    friend struct raid::xml::Vocabulary<RAIDTempSensor>;

    std::string tempSensorType;  // xsi:type
    int index = 0;
    int status = 0;
    int adapterID = 0;
    int channelID = 0;
    int enclosureID = 0;
};

/// ac:deviceSlotID
class [[gnu::visibility("default")]] RAIDDeviceSlotID {
public:
    RAIDDeviceSlotID() = default;
    RAIDDeviceSlotID(const char* text, int length, int* consumed);

    [[nodiscard]] std::string getDeviceSlotIDType() const { return deviceSlotIDType; }
    [[nodiscard]] int getIndex() const { return index; }
    [[nodiscard]] int getSlotID() const { return slotID; }
    [[nodiscard]] int getAdapterID() const { return adapterID; }
    [[nodiscard]] int getChannelID() const { return channelID; }
    [[nodiscard]] int getEnclosureID() const { return enclosureID; }
    void setStructureData(int adapter, int channel, int enclosure) {
        adapterID = adapter;
        channelID = channel;
        enclosureID = enclosure;
    }

private:
    friend struct raid::xml::Vocabulary<RAIDDeviceSlotID>;

    std::string deviceSlotIDType;  // xsi:type
    int index = 0;
    int slotID = 0;
    int adapterID = 0;
    int channelID = 0;
    int enclosureID = 0;
};

/// ac:enclosure
class [[gnu::visibility("default")]] RAIDEnclosureDevice {
public:
    RAIDEnclosureDevice() = default;
    RAIDEnclosureDevice(const char* text, int length, int* consumed);

    [[nodiscard]] std::string getEnclosureDeviceType() const { return enclosureDeviceType; }
    [[nodiscard]] int getAdapterID() const { return adapterID; }
    [[nodiscard]] int getLogicalID() const { return logicalID; }
    [[nodiscard]] int getChannelID() const { return channelID; }
    [[nodiscard]] std::string getFirmwareLevel() const { return firmwareLevel; }
    [[nodiscard]] std::string getVendor() const { return vendor; }
    [[nodiscard]] int getType() const { return type; }
    [[nodiscard]] int getDeviceID() const { return deviceID; }
    [[nodiscard]] int getArrayID() const { return arrayID; }
    [[nodiscard]] std::string getFruNumber() const { return fruNumber; }
    [[nodiscard]] int getOverallStatus() const { return overallStatus; }
    [[nodiscard]] int getState() const { return state; }
    [[nodiscard]] std::string getModel() const { return model; }
    [[nodiscard]] std::string getSerialNumber() const { return serialNumber; }
    [[nodiscard]] std::string getInterfaceType() const { return interfaceType; }
    [[nodiscard]] std::vector<RAIDFan> getFans() const { return fans; }
    [[nodiscard]] std::vector<RAIDPowerSupply> getPowerSupplys() const { return powerSupplies; }
    [[nodiscard]] std::vector<RAIDTempSensor> getTempSensors() const { return tempSensors; }
    [[nodiscard]] std::vector<RAIDDeviceSlotID> getDeviceSlotIDs() const { return deviceSlotIDs; }

    /// Gives every part the enclosure's adapterID, channelID and deviceID.
    void setStructureData();
    void dump() const {}

private:
    friend struct raid::xml::Vocabulary<RAIDEnclosureDevice>;
    friend struct raid::Navigation;

    std::string enclosureDeviceType;  // xsi:type
    int adapterID = 0;
    int logicalID = 0;
    int channelID = 0;
    std::string firmwareLevel;
    std::string vendor;
    int type = 0;
    int deviceID = 0;
    int arrayID = 0;
    std::string fruNumber;
    int overallStatus = 0;
    int state = 0;
    std::string model;
    std::string serialNumber;
    std::string interfaceType;
    std::vector<RAIDFan> fans;
    std::vector<RAIDPowerSupply> powerSupplies;
    std::vector<RAIDTempSensor> tempSensors;
    std::vector<RAIDDeviceSlotID> deviceSlotIDs;
};
