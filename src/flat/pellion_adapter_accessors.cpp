#include "flat/accessors.h"
#include "flat/initiator_ids.h"
#include "flat/lists.h"
#include "model/system_and_adapter_vocabulary.h"

namespace {

using Adapter = RAIDAdapter;
constexpr raid::flat::Family adapters(PellionAdapterList);

}  // namespace

int getPellionAdapterCount() { return adapters.count(); }

int getPellionAdapterAdapterID(int at) { return adapters.number<&Adapter::getAdapterID>(at); }
int getPellionAdapterPhysicalSlot(int at) { return adapters.number<&Adapter::getPhysicalSlot>(at); }
int getPellionAdapterClustering(int at) { return adapters.number<&Adapter::getClustering>(at); }
int getPellionAdapterBatteryStatus(int at) {
    return adapters.number<&Adapter::getBatteryStatus>(at);
}
int getPellionAdapterHotSwapRebuild(int at) {
    return adapters.number<&Adapter::getHotSwapRebuild>(at);
}
int getPellionAdapterStripeUnitSize(int at) {
    return adapters.number<&Adapter::getStripeUnitSize>(at);
}
int getPellionAdapterDataScrubbing(int at) {
    return adapters.number<&Adapter::getDataScrubbing>(at);
}
int getPellionAdapterAutoSynchronization(int at) {
    return adapters.number<&Adapter::getAutoSynchronization>(at);
}
int getPellionAdapterUnattended(int at) { return adapters.number<&Adapter::getUnattended>(at); }
int getPellionAdapterLimitedBIOSCompatibility(int at) {
    return adapters.number<&Adapter::getLimitedBIOSCompatibility>(at);
}

void getPellionAdapterDriverVersion(char* to, int at) { adapters.text<"as:driverVersion">(to, at); }
void getPellionAdapterBatteryFruNumber(char* to, int at) {
    adapters.text<"as:batteryFruNumber">(to, at);
}
void getPellionAdapterFruNumber(char* to, int at) { adapters.text<"as:fruNumber">(to, at); }
void getPellionAdapterPartNumber(char* to, int at) { adapters.text<"as:partNumber">(to, at); }
void getPellionAdapterSerialNumber(char* to, int at) { adapters.text<"as:serialNumber">(to, at); }
void getPellionAdapterTypeName(char* to, int at) { adapters.text<"as:typeName">(to, at); }
void getPellionAdapterFirmwareVersion(char* to, int at) {
    adapters.text<"as:firmwareVersion">(to, at);
}
void getPellionAdapterBiosVersion(char* to, int at) { adapters.text<"as:biosVersion">(to, at); }

int getPellionAdapterAdapterIDString(char* to, int at) {
    return adapters.displayName<"Pellion Adapter %d", &Adapter::getAdapterID>(to, at);
}

void getPellionAdapterOverallStatusString(char* to, int at) { adapters.overallStatus(to, at); }

void getPellionAdapterInitiatorIDs(char* to, int at) {
    raid::flat::initiatorIDs(to, adapters.at(at));
}

// Callers ask without a position; all adapters have this policy.
int getPellionAdapterCacheReadPolicy() { return 0; }
