#pragma once

#include "model/enclosures.h"
#include "xml/element_reader.h"

// What the readers know of each element, row by row.

template <>
struct raid::xml::Vocabulary<RAIDFan> {
    static constexpr Words<RAIDFan> words{.element = "ac:fan",
                                          .endWord = "Fan",
                                          .entry = "RAIDFan Constructor\n",
                                          .exit = "Exit RAIDFan Constructor\n"};
    static constexpr auto type = &RAIDFan::fanType;
    static constexpr std::tuple children{
        number("as:index", &RAIDFan::index),
        number("as:status", &RAIDFan::status),
    };
};

template <>
struct raid::xml::Vocabulary<RAIDPowerSupply> {
    static constexpr Words<RAIDPowerSupply> words{.element = "ac:powerSupply",
                                                  .endWord = "PowerSupply",
                                                  .entry = "RAIDPowerSupply Constructor\n",
                                                  .exit = "Exit RAIDPowerSupply Constructor\n"};
    static constexpr auto type = &RAIDPowerSupply::powerSupplyType;
    static constexpr std::tuple children{
        number("as:index", &RAIDPowerSupply::index),
        number("as:status", &RAIDPowerSupply::status),
    };
};

template <>
struct raid::xml::Vocabulary<RAIDTempSensor> {
    static constexpr Words<RAIDTempSensor> words{.element = "ac:tempSensor",
                                                 .endWord = "TempSensor",
                                                 .entry = "RAIDTempSensor Constructor\n",
                                                 .exit = "Exit RAIDTempSensor Constructor\n"};
    static constexpr auto type = &RAIDTempSensor::tempSensorType;
    static constexpr std::tuple children{
        number("as:index", &RAIDTempSensor::index),
        number("as:status", &RAIDTempSensor::status),
    };
};

template <>
struct raid::xml::Vocabulary<RAIDDeviceSlotID> {
    static constexpr Words<RAIDDeviceSlotID> words{.element = "ac:deviceSlotID",
                                                   .endWord = "DeviceSlotID",
                                                   .entry = "RAIDDeviceSlotID Constructor\n",
                                                   .exit = "Exit RAIDDeviceSlotID Constructor\n"};
    static constexpr auto type = &RAIDDeviceSlotID::deviceSlotIDType;
    static constexpr std::tuple children{
        number("as:index", &RAIDDeviceSlotID::index),
        number("as:slotID", &RAIDDeviceSlotID::slotID),
    };
};

template <>
struct raid::xml::Vocabulary<RAIDEnclosureDevice> {
    static constexpr Words<RAIDEnclosureDevice> words{
        .element = "ac:enclosure",
        .endWord = "EnclosureDevice",
        .entry = "RAIDEnclosureDevice Constructor\n",
        .exit = "Exit RAIDEnclosureDevice Constructor\n"};
    static constexpr auto type = &RAIDEnclosureDevice::enclosureDeviceType;
    static constexpr std::tuple children{
        number("as:adapterID", &RAIDEnclosureDevice::adapterID),
        number("as:logicalID", &RAIDEnclosureDevice::logicalID),
        number("as:channelID", &RAIDEnclosureDevice::channelID),
        text("as:firmwareLevel", &RAIDEnclosureDevice::firmwareLevel),
        text("as:vendor", &RAIDEnclosureDevice::vendor),
        number("as:type", &RAIDEnclosureDevice::type),
        number("as:deviceID", &RAIDEnclosureDevice::deviceID),
        number("as:arrayID", &RAIDEnclosureDevice::arrayID),
        text("as:fruNumber", &RAIDEnclosureDevice::fruNumber),
        number("as:overallStatus", &RAIDEnclosureDevice::overallStatus),
        number("as:state", &RAIDEnclosureDevice::state),
        text("as:model", &RAIDEnclosureDevice::model),
        text("as:serialNumber", &RAIDEnclosureDevice::serialNumber),
        text("as:interfaceType", &RAIDEnclosureDevice::interfaceType),
        each<&RAIDEnclosureDevice::fans>("ac:fan"),
        each<&RAIDEnclosureDevice::powerSupplies>("ac:powerSupply"),
        each<&RAIDEnclosureDevice::tempSensors>("ac:tempSensor"),
        each<&RAIDEnclosureDevice::deviceSlotIDs>("ac:deviceSlotID"),
    };
};
