#pragma once

#include "model/channels_and_drives.h"
#include "model/enclosures_vocabulary.h"
#include "model/logical_drives_vocabulary.h"
#include "xml/element_reader.h"

// What the readers know of each element, row by row.

template <>
struct raid::xml::Vocabulary<RAIDHardDrive> {
    static constexpr Words<RAIDHardDrive> words{.element = "ac:hardDrive",
                                                .endWord = "HardDrive",
                                                .entry = "RAIDHardDrive Constructor\n",
                                                .exit = "Exit RAIDHardDrive Constructor\n"};
    static constexpr auto type = &RAIDHardDrive::hardDriveType;
    static constexpr std::tuple children{
        text("as:firmwareLevel", &RAIDHardDrive::firmwareLevel),
        text("as:vendor", &RAIDHardDrive::vendor),
        number("as:type", &RAIDHardDrive::type),
        flag("as:smartError", &RAIDHardDrive::smartError),
        text("as:fruNumber", &RAIDHardDrive::fruNumber),
        number("as:overallStatus", &RAIDHardDrive::overallStatus),
        number("as:state", &RAIDHardDrive::state),
        text("as:model", &RAIDHardDrive::model),
        flag("as:writeCacheEnableSupported", &RAIDHardDrive::writeCacheEnableSupported),
        number("as:size", &RAIDHardDrive::size),
        text("as:serialNumber", &RAIDHardDrive::serialNumber),
        number("as:writeCacheEnable", &RAIDHardDrive::writeCacheEnable),
        flag("as:hasOSPartition", &RAIDHardDrive::hasOSPartition),
        number("as:arrayUniqueID", &RAIDHardDrive::arrayUniqueID),
        flag("as:isAssignedHotSpare", &RAIDHardDrive::isAssignedHotSpare),
        flag("as:isGlobalHotSpare", &RAIDHardDrive::isGlobalHotSpare),
        number("as:hotSpareType", &RAIDHardDrive::hotSpareType),
        number("as:deviceID", &RAIDHardDrive::deviceID),
        number("as:adapterID", &RAIDHardDrive::adapterID),
        number("as:channelID", &RAIDHardDrive::channelID),
        passed<RAIDHardDrive, RAIDProgress>("ac:progress"),
    };
};

template <>
struct raid::xml::Vocabulary<RAIDChannel> {
    static constexpr Words<RAIDChannel> words{.element = "ac:channel",
                                              .endWord = "channel",
                                              .entry = "RAIDChannel Constructor\n",
                                              .exit = "Exit RAIDChannel Constructor\n"};
    static constexpr auto type = &RAIDChannel::channelType;
    static constexpr std::tuple children{
        number("as:initiatorID", &RAIDChannel::initiatorID),
        number("as:channelID", &RAIDChannel::channelID),
        number("as:type", &RAIDChannel::type),
        number("as:transferSpeed", &RAIDChannel::transferSpeed),
        number("as:overallStatus", &RAIDChannel::overallStatus),
        each<&RAIDChannel::hardDrives>("ac:hardDrive"),
        each<&RAIDChannel::enclosures>("ac:enclosure"),
        number("as:adapterID", &RAIDChannel::adapterID),
    };
};

template <>
struct raid::xml::Vocabulary<RAIDPhysicalDrives> {
    static constexpr Words<RAIDPhysicalDrives> words{
        .element = "ac:physicalDrives",
        .endWord = "physicalDrives",
        .entry = "RAIDPhysicalDrives Constructor\n",
        .exit = "Exit RAIDPhysicalDrives Constructor\n"};
    static constexpr auto type = &RAIDPhysicalDrives::physicalDrivesType;
    static constexpr std::tuple children{
        number("as:overallStatus", &RAIDPhysicalDrives::overallStatus),
        each<&RAIDPhysicalDrives::channels>("ac:channel"),
    };
};

template <>
struct raid::xml::Vocabulary<RAIDHotSpareDrives> {
    static constexpr Words<RAIDHotSpareDrives> words{
        .element = "ac:hotSpareDrives",
        .endWord = "HotSpareDrives",
        .entry = "RAIDHotSpareDrives Constructor\n",
        .exit = "Exit RAIDHotSpareDrives Constructor\n"};
    static constexpr auto type = &RAIDHotSpareDrives::hotSpareDrivesType;
    static constexpr std::tuple children{
        number("as:overallStatus", &RAIDHotSpareDrives::overallStatus),
        each<&RAIDHotSpareDrives::hardDrives>("ac:hardDrive"),
    };
};
