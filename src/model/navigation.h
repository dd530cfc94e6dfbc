#pragma once

#include "model/arrays.h"
#include "model/channels_and_drives.h"
#include "model/enclosures.h"
#include "model/logical_drives.h"
#include "model/system_and_adapter.h"

namespace raid {

/// Ways into the tree that copy nothing, for the snapshot: the public getters return deep copies,
/// and only what is published needs to be copied.
struct Navigation {
    static const auto& adapters(const RAIDSystem& system) { return system.adapters; }
    static const auto& type(const RAIDAdapter& adapter) { return adapter.adapterType; }
    static const auto& channels(const RAIDAdapter& adapter) {
        return channels(adapter.physicalDrives);
    }
    static const auto& logicalDrives(const RAIDAdapter& adapter) {
        return drives(adapter.logicalDrives);
    }
    static const auto& basicArrays(const RAIDAdapter& adapter) { return adapter.arrays.basicArray; }
    static const auto& spannedArrays(const RAIDAdapter& adapter) {
        return adapter.arrays.spannedArray;
    }
    static const auto& basicArrays(const RAIDSpannedArray& array) {
        return array.arrays.basicArray;
    }
    static const auto& channels(const RAIDBasicArray& array) {
        return channels(array.physicalDrives);
    }
    static const auto& logicalDrives(const RAIDBasicArray& array) {
        return drives(array.logicalDrives);
    }
    static const auto& hardDrives(const RAIDChannel& channel) { return channel.hardDrives; }
    static const auto& enclosures(const RAIDChannel& channel) { return channel.enclosures; }
    static const auto& fans(const RAIDEnclosureDevice& enclosure) { return enclosure.fans; }
    static const auto& powerSupplies(const RAIDEnclosureDevice& enclosure) {
        return enclosure.powerSupplies;
    }
    static const auto& tempSensors(const RAIDEnclosureDevice& enclosure) {
        return enclosure.tempSensors;
    }

private:
    static const std::vector<RAIDChannel>& channels(const RAIDPhysicalDrives& drives) {
        return drives.channels;
    }
    static const std::vector<RAIDLogicalDrive>& drives(const RAIDLogicalDrives& drives) {
        return drives.logicalDrive;
    }
};

}  // namespace raid
