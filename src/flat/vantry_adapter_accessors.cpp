#include "flat/accessors.h"
#include "flat/initiator_ids.h"
#include "flat/lists.h"
#include "model/system_and_adapter_vocabulary.h"

using namespace raid::flat;

int getVantryAdapterCount() { return count(VantryAdapterList); }

int getVantryAdapterAdapterID(int position) {
    return number<&RAIDAdapter::getAdapterID>(VantryAdapterList, position);
}
int getVantryAdapterPhysicalSlot(int position) {
    return number<&RAIDAdapter::getPhysicalSlot>(VantryAdapterList, position);
}
int getVantryAdapterClustering(int position) {
    return number<&RAIDAdapter::getClustering>(VantryAdapterList, position);
}
int getVantryAdapterBatteryStatus(int position) {
    return number<&RAIDAdapter::getBatteryStatus>(VantryAdapterList, position);
}

void getVantryAdapterDriverVersion(char* destination, int position) {
    text<"as:driverVersion">(destination, VantryAdapterList, position);
}
void getVantryAdapterBatteryFruNumber(char* destination, int position) {
    text<"as:batteryFruNumber">(destination, VantryAdapterList, position);
}
void getVantryAdapterFruNumber(char* destination, int position) {
    text<"as:fruNumber">(destination, VantryAdapterList, position);
}
void getVantryAdapterPartNumber(char* destination, int position) {
    text<"as:partNumber">(destination, VantryAdapterList, position);
}
void getVantryAdapterSerialNumber(char* destination, int position) {
    text<"as:serialNumber">(destination, VantryAdapterList, position);
}
void getVantryAdapterTypeName(char* destination, int position) {
    text<"as:typeName">(destination, VantryAdapterList, position);
}
void getVantryAdapterFirmwareVersion(char* destination, int position) {
    text<"as:firmwareVersion">(destination, VantryAdapterList, position);
}
void getVantryAdapterBiosVersion(char* destination, int position) {
    text<"as:biosVersion">(destination, VantryAdapterList, position);
}

int getVantryAdapterAdapterIDString(char* destination, int position) {
    return displayName<"Vantry Adapter %d", &RAIDAdapter::getAdapterID>(
        destination, VantryAdapterList, position);
}

void getVantryAdapterOverallStatusString(char* destination, int position) {
    overallStatus(destination, VantryAdapterList, position);
}

void getVantryAdapterInitiatorIDs(char* destination, int position) {
    initiatorIDs(destination, VantryAdapterList, position);
}
