#include "flat/accessors.h"
#include "flat/initiator_ids.h"
#include "flat/lists.h"
#include "model/system_and_adapter_vocabulary.h"

using namespace raid::flat;

int getLSIAdapterCount() { return count(LSIAdapterList); }

int getLSIAdapterAdapterID(int position) {
    return number<&RAIDAdapter::getAdapterID>(LSIAdapterList, position);
}
int getLSIAdapterPhysicalSlot(int position) {
    return number<&RAIDAdapter::getPhysicalSlot>(LSIAdapterList, position);
}
int getLSIAdapterClustering(int position) {
    return number<&RAIDAdapter::getClustering>(LSIAdapterList, position);
}
int getLSIAdapterBatteryStatus(int position) {
    return number<&RAIDAdapter::getBatteryStatus>(LSIAdapterList, position);
}
int getLSIAdapterHotSwapRebuild(int position) {
    return number<&RAIDAdapter::getHotSwapRebuild>(LSIAdapterList, position);
}

void getLSIAdapterDriverVersion(char* destination, int position) {
    text<"as:driverVersion">(destination, LSIAdapterList, position);
}
void getLSIAdapterBatteryFruNumber(char* destination, int position) {
    text<"as:batteryFruNumber">(destination, LSIAdapterList, position);
}
void getLSIAdapterFruNumber(char* destination, int position) {
    text<"as:fruNumber">(destination, LSIAdapterList, position);
}
void getLSIAdapterPartNumber(char* destination, int position) {
    text<"as:partNumber">(destination, LSIAdapterList, position);
}
void getLSIAdapterSerialNumber(char* destination, int position) {
    text<"as:serialNumber">(destination, LSIAdapterList, position);
}
void getLSIAdapterTypeName(char* destination, int position) {
    text<"as:typeName">(destination, LSIAdapterList, position);
}
void getLSIAdapterFirmwareVersion(char* destination, int position) {
    text<"as:firmwareVersion">(destination, LSIAdapterList, position);
}
void getLSIAdapterBiosVersion(char* destination, int position) {
    text<"as:biosVersion">(destination, LSIAdapterList, position);
}

int getLSIAdapterAdapterIDString(char* destination, int position) {
    return displayName<"LSI Adapter %d", &RAIDAdapter::getAdapterID>(destination, LSIAdapterList,
                                                                     position);
}

void getLSIAdapterOverallStatusString(char* destination, int position) {
    overallStatus(destination, LSIAdapterList, position);
}

void getLSIAdapterInitiatorIDs(char* destination, int position) {
    initiatorIDs(destination, LSIAdapterList, position);
}
