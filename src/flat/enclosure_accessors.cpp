#include "flat/accessors.h"
#include "flat/lists.h"
#include "model/enclosures_vocabulary.h"

using namespace raid::flat;

int getRAIDEnclosureDeviceCount() { return count(RAIDEnclosureDeviceList); }

int getRAIDEnclosureDeviceState(int position) {
    return number<&RAIDEnclosureDevice::getState>(RAIDEnclosureDeviceList, position);
}
int getRAIDEnclosureDeviceArrayID(int position) {
    return number<&RAIDEnclosureDevice::getArrayID>(RAIDEnclosureDeviceList, position);
}
int getRAIDEnclosureDeviceDeviceID(int position) {
    return number<&RAIDEnclosureDevice::getDeviceID>(RAIDEnclosureDeviceList, position);
}
int getRAIDEnclosureDeviceType(int position) {
    return number<&RAIDEnclosureDevice::getType>(RAIDEnclosureDeviceList, position);
}
int getRAIDEnclosureDeviceChannelID(int position) {
    return number<&RAIDEnclosureDevice::getChannelID>(RAIDEnclosureDeviceList, position);
}
int getRAIDEnclosureDeviceLogicalID(int position) {
    return number<&RAIDEnclosureDevice::getLogicalID>(RAIDEnclosureDeviceList, position);
}
int getRAIDEnclosureDeviceAdapterID(int position) {
    return number<&RAIDEnclosureDevice::getAdapterID>(RAIDEnclosureDeviceList, position);
}

void getRAIDEnclosureDeviceSerialNumber(char* destination, int position) {
    text<"as:serialNumber">(destination, RAIDEnclosureDeviceList, position);
}
void getRAIDEnclosureDeviceModel(char* destination, int position) {
    text<"as:model">(destination, RAIDEnclosureDeviceList, position);
}
void getRAIDEnclosureDeviceFruNumber(char* destination, int position) {
    text<"as:fruNumber">(destination, RAIDEnclosureDeviceList, position);
}
void getRAIDEnclosureDeviceVendor(char* destination, int position) {
    text<"as:vendor">(destination, RAIDEnclosureDeviceList, position);
}
void getRAIDEnclosureDeviceFirmwareLevel(char* destination, int position) {
    text<"as:firmwareLevel">(destination, RAIDEnclosureDeviceList, position);
}
void getRAIDEnclosureDeviceEnclosureDeviceType(char* destination, int position) {
    text<"xsi:type">(destination, RAIDEnclosureDeviceList, position);
}

int getRAIDEnclosureDeviceEnclosureDeviceIDString(char* destination, int position) {
    return displayName<"Disk Drive %d", &RAIDEnclosureDevice::getDeviceID>(
        destination, RAIDEnclosureDeviceList, position);
}
int getRAIDEnclosureDeviceChannelIDString(char* destination, int position) {
    return displayName<"Channel %d", &RAIDEnclosureDevice::getChannelID>(
        destination, RAIDEnclosureDeviceList, position);
}
int getRAIDEnclosureDeviceAdapterIDString(char* destination, int position) {
    return displayName<"Controller %d", &RAIDEnclosureDevice::getAdapterID>(
        destination, RAIDEnclosureDeviceList, position);
}

void getRAIDEnclosureDeviceOverallStatusString(char* destination, int position) {
    overallStatus(destination, RAIDEnclosureDeviceList, position);
}
