#include "flat/accessors.h"
#include "flat/initiator_ids.h"
#include "flat/lists.h"
#include "model/system_and_adapter_vocabulary.h"

using namespace raid::flat;

int getPellionAdapterCount() { return count(PellionAdapterList); }

int getPellionAdapterAdapterID(int position) {
    return number<&RAIDAdapter::getAdapterID>(PellionAdapterList, position);
}
int getPellionAdapterPhysicalSlot(int position) {
    return number<&RAIDAdapter::getPhysicalSlot>(PellionAdapterList, position);
}
int getPellionAdapterClustering(int position) {
    return number<&RAIDAdapter::getClustering>(PellionAdapterList, position);
}
int getPellionAdapterBatteryStatus(int position) {
    return number<&RAIDAdapter::getBatteryStatus>(PellionAdapterList, position);
}
int getPellionAdapterHotSwapRebuild(int position) {
    return number<&RAIDAdapter::getHotSwapRebuild>(PellionAdapterList, position);
}
int getPellionAdapterStripeUnitSize(int position) {
    return number<&RAIDAdapter::getStripeUnitSize>(PellionAdapterList, position);
}
int getPellionAdapterDataScrubbing(int position) {
    return number<&RAIDAdapter::getDataScrubbing>(PellionAdapterList, position);
}
int getPellionAdapterAutoSynchronization(int position) {
    return number<&RAIDAdapter::getAutoSynchronization>(PellionAdapterList, position);
}
int getPellionAdapterUnattended(int position) {
    return number<&RAIDAdapter::getUnattended>(PellionAdapterList, position);
}
int getPellionAdapterLimitedBIOSCompatibility(int position) {
    return number<&RAIDAdapter::getLimitedBIOSCompatibility>(PellionAdapterList, position);
}

void getPellionAdapterDriverVersion(char* destination, int position) {
    text<"as:driverVersion">(destination, PellionAdapterList, position);
}
void getPellionAdapterBatteryFruNumber(char* destination, int position) {
    text<"as:batteryFruNumber">(destination, PellionAdapterList, position);
}
void getPellionAdapterFruNumber(char* destination, int position) {
    text<"as:fruNumber">(destination, PellionAdapterList, position);
}
void getPellionAdapterPartNumber(char* destination, int position) {
    text<"as:partNumber">(destination, PellionAdapterList, position);
}
void getPellionAdapterSerialNumber(char* destination, int position) {
    text<"as:serialNumber">(destination, PellionAdapterList, position);
}
void getPellionAdapterTypeName(char* destination, int position) {
    text<"as:typeName">(destination, PellionAdapterList, position);
}
void getPellionAdapterFirmwareVersion(char* destination, int position) {
    text<"as:firmwareVersion">(destination, PellionAdapterList, position);
}
void getPellionAdapterBiosVersion(char* destination, int position) {
    text<"as:biosVersion">(destination, PellionAdapterList, position);
}

int getPellionAdapterAdapterIDString(char* destination, int position) {
    return displayName<"Pellion Adapter %d", &RAIDAdapter::getAdapterID>(
        destination, PellionAdapterList, position);
}

void getPellionAdapterOverallStatusString(char* destination, int position) {
    overallStatus(destination, PellionAdapterList, position);
}

void getPellionAdapterInitiatorIDs(char* destination, int position) {
    initiatorIDs(destination, PellionAdapterList, position);
}

// Callers ask without a position; the adapters have one policy.
int getPellionAdapterCacheReadPolicy() { return 0; }
