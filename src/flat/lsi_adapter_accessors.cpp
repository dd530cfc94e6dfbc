#include "flat/accessors.h"
#include "flat/initiator_ids.h"
#include "flat/lists.h"
#include "model/system_and_adapter_vocabulary.h"

namespace {

using Adapter = RAIDAdapter;
constexpr raid::flat::Family adapters(LSIAdapterList);

}  // namespace

int getLSIAdapterCount() { return adapters.count(); }

int getLSIAdapterAdapterID(int at) { return adapters.number<&Adapter::getAdapterID>(at); }
int getLSIAdapterPhysicalSlot(int at) { return adapters.number<&Adapter::getPhysicalSlot>(at); }
int getLSIAdapterClustering(int at) { return adapters.number<&Adapter::getClustering>(at); }
int getLSIAdapterBatteryStatus(int at) { return adapters.number<&Adapter::getBatteryStatus>(at); }
int getLSIAdapterHotSwapRebuild(int at) { return adapters.number<&Adapter::getHotSwapRebuild>(at); }

void getLSIAdapterDriverVersion(char* to, int at) { adapters.text<"as:driverVersion">(to, at); }
void getLSIAdapterBatteryFruNumber(char* to, int at) {
    adapters.text<"as:batteryFruNumber">(to, at);
}
void getLSIAdapterFruNumber(char* to, int at) { adapters.text<"as:fruNumber">(to, at); }
void getLSIAdapterPartNumber(char* to, int at) { adapters.text<"as:partNumber">(to, at); }
void getLSIAdapterSerialNumber(char* to, int at) { adapters.text<"as:serialNumber">(to, at); }
void getLSIAdapterTypeName(char* to, int at) { adapters.text<"as:typeName">(to, at); }
void getLSIAdapterFirmwareVersion(char* to, int at) { adapters.text<"as:firmwareVersion">(to, at); }
void getLSIAdapterBiosVersion(char* to, int at) { adapters.text<"as:biosVersion">(to, at); }

int getLSIAdapterAdapterIDString(char* to, int at) {
    return adapters.displayName<"LSI Adapter %d", &Adapter::getAdapterID>(to, at);
}

void getLSIAdapterOverallStatusString(char* to, int at) { adapters.overallStatus(to, at); }

void getLSIAdapterInitiatorIDs(char* to, int at) { raid::flat::initiatorIDs(to, adapters.at(at)); }
