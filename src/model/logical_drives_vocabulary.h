#pragma once

#include "model/logical_drives.h"
#include "xml/element_reader.h"

// What the readers know of each element, row by row.

template <>
struct raid::xml::Vocabulary<RAIDChunks> {
    static constexpr Words<RAIDChunks> words{.element = "ac:chunks",
                                             .endWord = "chunks",
                                             .entry = "RAIDChunks Constructor\n",
                                             .exit = "Exit RAIDChunks Constructor\n"};
    static constexpr auto type = &RAIDChunks::chunksType;
};

template <>
struct raid::xml::Vocabulary<RAIDLimits> {
    static constexpr Words<RAIDLimits> words{.element = "ac:limits",
                                             .endWord = "limits",
                                             .entry = "RAIDLimits Constructor\n",
                                             .exit = "Exit RAIDLimits Constructor\n"};
    static constexpr auto type = &RAIDLimits::limitsType;
};

template <>
struct raid::xml::Vocabulary<RAIDProgress> {
    static constexpr Words<RAIDProgress> words{.element = "ac:progress",
                                               .endWord = "progress",
                                               .entry = "RAIDProgress Constructor\n",
                                               .exit = "Exit RAIDProgress Constructor\n"};
    static constexpr auto type = &RAIDProgress::progressType;
};

template <>
struct raid::xml::Vocabulary<RAIDLogicalDrive> {
    static constexpr Words<RAIDLogicalDrive> words{.element = "ac:logicalDrive",
                                                   .endWord = "logicalDrive",
                                                   .entry = "RAIDLogicalDrive Constructor\n",
                                                   .exit = "Exit RAIDLogicalDrive Constructor\n"};
    static constexpr auto type = &RAIDLogicalDrive::logicalDriveType;
    static constexpr std::tuple children{
        number("as:overallStatus", &RAIDLogicalDrive::overallStatus),
        number("as:type", &RAIDLogicalDrive::type),
        number("as:stripeUnitSize", &RAIDLogicalDrive::stripeUnitSize),
        flag("as:blocked", &RAIDLogicalDrive::blocked),
        number("as:writeCacheMode", &RAIDLogicalDrive::writeCacheMode),
        number("as:raidLevel", &RAIDLogicalDrive::raidLevel),
        number("as:logicalDriveID", &RAIDLogicalDrive::logicalDriveID),
        number("as:dataSpace", &RAIDLogicalDrive::dataSpace),
        number("as:paritySpace", &RAIDLogicalDrive::paritySpace),
        flag("as:shared", &RAIDLogicalDrive::shared),
        number("as:state", &RAIDLogicalDrive::state),
        number("as:r5eeSubstate", &RAIDLogicalDrive::r5eeSubstate),
        text("as:name", &RAIDLogicalDrive::name),
        number("as:readCacheMode", &RAIDLogicalDrive::readCacheMode),
        one<&RAIDLogicalDrive::chunks>("ac:chunks"),
        passed<RAIDLogicalDrive, RAIDProgress>("ac:progress"),
        number("as:adapterID", &RAIDLogicalDrive::adapterID),
        number("as:logicalID", &RAIDLogicalDrive::logicalID),
    };
};

template <>
struct raid::xml::Vocabulary<RAIDLogicalDrives> {
    static constexpr Words<RAIDLogicalDrives> words{.element = "ac:logicalDrives",
                                                    .endWord = "logicalDrives",
                                                    .entry = "RAIDLogicalDrives Constructor\n",
                                                    .exit = "Exit RAIDLogicalDrives Constructor\n"};
    static constexpr auto type = &RAIDLogicalDrives::logicalDrivesType;
    static constexpr std::tuple children{
        number("as:overallStatus", &RAIDLogicalDrives::overallStatus),
        each<&RAIDLogicalDrives::logicalDrive>("ac:logicalDrive"),
    };
};
