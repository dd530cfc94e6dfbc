#pragma once

#include "model/arrays_vocabulary.h"
#include "model/channels_and_drives_vocabulary.h"
#include "model/logical_drives_vocabulary.h"
#include "model/system_and_adapter.h"
#include "xml/element_reader.h"

// What the readers know of each element, row by row.

template <>
struct raid::xml::Vocabulary<RAIDAdapter> {
    static constexpr Words<RAIDAdapter> words{.element = "ac:adapter",
                                              .endWord = "adapter",
                                              .entry = "RAIDAdapter Constructor\n",
                                              .exit = "Exit RAIDSystem Constructor\n",
                                              .context = "RAIDSystem"};
    static constexpr auto type = &RAIDAdapter::adapterType;
    static constexpr std::tuple children{
        flag("as:hotSwapRebuild", &RAIDAdapter::hotSwapRebuild),
        number("as:stripeUnitSize", &RAIDAdapter::stripeUnitSize),
        number("as:batteryStatus", &RAIDAdapter::batteryStatus),
        flag("as:copyBack", &RAIDAdapter::copyBack),
        flag("as:simulated", &RAIDAdapter::simulated),
        number("as:adapterStatus", &RAIDAdapter::adapterStatus),
        number("as:overallStatus", &RAIDAdapter::overallStatus),
        number("as:physicalSlot", &RAIDAdapter::physicalSlot),
        text("as:biosVersion", &RAIDAdapter::biosVersion),
        flag("as:dataScrubbing", &RAIDAdapter::dataScrubbing),
        flag("as:readAhead", &RAIDAdapter::readAhead),
        text("as:firmwareVersion", &RAIDAdapter::firmwareVersion),
        number("as:batteryCacheErrorCode", &RAIDAdapter::batteryCacheErrorCode),
        number("as:rebuildRate", &RAIDAdapter::rebuildRate),
        number("as:adapterID", &RAIDAdapter::adapterID),
        flag("as:clustering", &RAIDAdapter::clustering),
        flag("as:unattended", &RAIDAdapter::unattended),
        number("as:type", &RAIDAdapter::type),
        flag("as:adaptiveReadAhead", &RAIDAdapter::adaptiveReadAhead),
        flag("as:batteryCacheInstalled", &RAIDAdapter::batteryCacheInstalled),
        flag("as:limitedBIOSCompatibility", &RAIDAdapter::limitedBIOSCompatibility),
        number("as:installedMemorySize", &RAIDAdapter::installedMemorySize),
        number("as:alarmStatus", &RAIDAdapter::alarmStatus, "as:alarmStatus"),
        text("as:typeName", &RAIDAdapter::typeName),
        flag("as:autoSynchronization", &RAIDAdapter::autoSynchronization),
        text("as:serialNumber", &RAIDAdapter::serialNumber),
        text("as:driverVersion", &RAIDAdapter::driverVersion),
        text("as:fruNumber", &RAIDAdapter::fruNumber),
        text("as:partNumber", &RAIDAdapter::partNumber),
        text("as:batteryFruNumber", &RAIDAdapter::batteryFruNumber),
        number("as:pciFunction", &RAIDAdapter::pciFunction),
        number("as:pciDevice", &RAIDAdapter::pciDevice),
        number("as:pciVendorID", &RAIDAdapter::pciVendorID),
        number("as:pciBus", &RAIDAdapter::pciBus),
        number("as:pciDeviceID", &RAIDAdapter::pciDeviceID),
        one<&RAIDAdapter::arrays>("ac:arrays"),
        one<&RAIDAdapter::logicalDrives>("ac:logicalDrives"),
        one<&RAIDAdapter::hotSpareDrives>("ac:hotSpareDrives"),
        one<&RAIDAdapter::physicalDrives>("ac:physicalDrives"),
        passed<RAIDAdapter, RAIDProgress>("ac:progress"),
        passed<RAIDAdapter, RAIDLimits>("ac:limits"),
    };
};

template <>
struct raid::xml::Vocabulary<RAIDSystem> {
    static constexpr Words<RAIDSystem> words{.element = "ac:system",
                                             .endWord = "system",
                                             .entry = "RAIDSystem Constructor\n",
                                             .exit = "Exit RAIDSystem Constructor\n",
                                             .context = "system",
                                             .detail = &RAIDSystem::name};
    static constexpr auto type = &RAIDSystem::systemType;
    static constexpr std::tuple children{
        each<&RAIDSystem::adapters>("ac:adapter"),
        text("as:osVersion", &RAIDSystem::osVersion),
        text("as:os", &RAIDSystem::os),
        number("as:overallStatus", &RAIDSystem::overallStatus),
        text("as:name", &RAIDSystem::name),
        text("as:agentVersion", &RAIDSystem::agentVersion),
    };
};
