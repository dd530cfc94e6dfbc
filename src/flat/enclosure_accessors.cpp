#include "flat/accessors.h"
#include "flat/lists.h"
#include "model/enclosures_vocabulary.h"

namespace {

using Enclosure = RAIDEnclosureDevice;
constexpr raid::flat::Family enclosures(RAIDEnclosureDeviceList);

}  // namespace

int getRAIDEnclosureDeviceCount() { return enclosures.count(); }

int getRAIDEnclosureDeviceState(int at) { return enclosures.number<&Enclosure::getState>(at); }
int getRAIDEnclosureDeviceArrayID(int at) { return enclosures.number<&Enclosure::getArrayID>(at); }
int getRAIDEnclosureDeviceDeviceID(int at) {
    return enclosures.number<&Enclosure::getDeviceID>(at);
}
int getRAIDEnclosureDeviceType(int at) { return enclosures.number<&Enclosure::getType>(at); }
int getRAIDEnclosureDeviceChannelID(int at) {
    return enclosures.number<&Enclosure::getChannelID>(at);
}
int getRAIDEnclosureDeviceLogicalID(int at) {
    return enclosures.number<&Enclosure::getLogicalID>(at);
}
int getRAIDEnclosureDeviceAdapterID(int at) {
    return enclosures.number<&Enclosure::getAdapterID>(at);
}

void getRAIDEnclosureDeviceSerialNumber(char* to, int at) {
    enclosures.text<"as:serialNumber">(to, at);
}
void getRAIDEnclosureDeviceModel(char* to, int at) { enclosures.text<"as:model">(to, at); }
void getRAIDEnclosureDeviceFruNumber(char* to, int at) { enclosures.text<"as:fruNumber">(to, at); }
void getRAIDEnclosureDeviceVendor(char* to, int at) { enclosures.text<"as:vendor">(to, at); }
void getRAIDEnclosureDeviceFirmwareLevel(char* to, int at) {
    enclosures.text<"as:firmwareLevel">(to, at);
}
void getRAIDEnclosureDeviceEnclosureDeviceType(char* to, int at) {
    enclosures.text<"xsi:type">(to, at);
}

int getRAIDEnclosureDeviceEnclosureDeviceIDString(char* to, int at) {
    return enclosures.displayName<"Disk Drive %d", &Enclosure::getDeviceID>(to, at);
}
int getRAIDEnclosureDeviceChannelIDString(char* to, int at) {
    return enclosures.displayName<"Channel %d", &Enclosure::getChannelID>(to, at);
}
int getRAIDEnclosureDeviceAdapterIDString(char* to, int at) {
    return enclosures.displayName<"Controller %d", &Enclosure::getAdapterID>(to, at);
}

void getRAIDEnclosureDeviceOverallStatusString(char* to, int at) {
    enclosures.overallStatus(to, at);
}
