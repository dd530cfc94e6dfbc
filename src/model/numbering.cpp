// Pushing identifiers down the tree. Where a step works on what a getter returns it works on
// copies and changes nothing that is stored, so those steps are not carried out: the identifiers
// that reach the lists come from the document and from the array IDs that the snapshot looks up.

#include "model/arrays.h"
#include "model/channels_and_drives.h"
#include "model/enclosures.h"
#include "model/system_and_adapter.h"

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
