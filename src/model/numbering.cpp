#include "model/numbering.h"

#include "model/arrays.h"
#include "model/enclosures.h"
#include "model/navigation.h"

// Pushing identifiers down the tree. Where a step works on what a getter returns it works on
// copies and changes nothing that is stored, so those steps are not carried out: the identifiers
// that reach the lists come from the document and from the array IDs that the snapshot looks up.

void RAIDSystem::setStructureData() {
    for (auto& adapter : adapters) {
        adapter.setStructureData();
    }
}

void RAIDAdapter::setStructureData() {
    // Arrays, logical drives, channels and hot spares are all reached through copies.
}

void RAIDBasicArray::setStructureData(int adapter) { adapterID = adapter; }

void RAIDSpannedArray::setStructureData(int adapter) { adapterID = adapter; }

void RAIDChannel::setStructureData(int adapter, int array) {
    adapterID = adapter;
    arrayID = array;
    for (auto& drive : hardDrives) {
        drive.setStructureData(adapter, channelID, array);
    }
}

void RAIDEnclosureDevice::setStructureData() {
    const auto number = [this](auto& parts) {
        for (auto& part : parts) {
            part.setStructureData(adapterID, channelID, deviceID);
        }
    };
    number(fans);
    number(powerSupplies);
    number(tempSensors);
    number(deviceSlotIDs);
}

namespace raid {
namespace {

std::uint64_t placeOf(int channel, int device) {
    return std::uint64_t{static_cast<std::uint32_t>(channel)} << 32U |
           static_cast<std::uint32_t>(device);
}

template <class Map>
std::optional<int> find(const Map& map, typename Map::key_type key) {
    const auto found = map.find(key);
    return found == map.end() ? std::nullopt : std::optional(found->second);
}

}  // namespace

ArrayMembers::ArrayMembers(const RAIDAdapter& adapter) {
    for (const auto& array : Navigation::basicArrays(adapter)) {
        for (const auto& channel : Navigation::channels(array)) {
            for (const auto& drive : Navigation::hardDrives(channel)) {
                arrayOfDrive[placeOf(channel.getChannelID(), drive.getDeviceID())] =
                    array.getArrayID();
            }
        }
        for (const auto& drive : Navigation::logicalDrives(array)) {
            arrayOfLogicalDrive[drive.getLogicalDriveID()] = array.getArrayID();
        }
    }
}

std::optional<int> ArrayMembers::arrayOf(const RAIDHardDrive& drive) const {
    return find(arrayOfDrive, placeOf(drive.getChannelID(), drive.getDeviceID()));
}

std::optional<int> ArrayMembers::arrayOf(const RAIDLogicalDrive& drive) const {
    return find(arrayOfLogicalDrive, drive.getLogicalDriveID());
}

}  // namespace raid
