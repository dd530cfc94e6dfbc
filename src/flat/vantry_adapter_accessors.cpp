#include "flat/accessors.h"
#include "flat/initiator_ids.h"
#include "flat/lists.h"
#include "model/system_and_adapter_vocabulary.h"

namespace {

using Adapter = RAIDAdapter;
constexpr raid::flat::Family adapters(VantryAdapterList);

}  // namespace

int getVantryAdapterCount() { return adapters.count(); }

int getVantryAdapterAdapterID(int at) { return adapters.number<&Adapter::getAdapterID>(at); }
int getVantryAdapterPhysicalSlot(int at) { return adapters.number<&Adapter::getPhysicalSlot>(at); }
int getVantryAdapterClustering(int at) { return adapters.number<&Adapter::getClustering>(at); }
int getVantryAdapterBatteryStatus(int at) {
    return adapters.number<&Adapter::getBatteryStatus>(at);
}

void getVantryAdapterDriverVersion(char* to, int at) { adapters.text<"as:driverVersion">(to, at); }
void getVantryAdapterBatteryFruNumber(char* to, int at) {
    adapters.text<"as:batteryFruNumber">(to, at);
}
void getVantryAdapterFruNumber(char* to, int at) { adapters.text<"as:fruNumber">(to, at); }
void getVantryAdapterPartNumber(char* to, int at) { adapters.text<"as:partNumber">(to, at); }
void getVantryAdapterSerialNumber(char* to, int at) { adapters.text<"as:serialNumber">(to, at); }
void getVantryAdapterTypeName(char* to, int at) { adapters.text<"as:typeName">(to, at); }
void getVantryAdapterFirmwareVersion(char* to, int at) {
    adapters.text<"as:firmwareVersion">(to, at);
}
void getVantryAdapterBiosVersion(char* to, int at) { adapters.text<"as:biosVersion">(to, at); }

int getVantryAdapterAdapterIDString(char* to, int at) {
    return adapters.displayName<"Vantry Adapter %d", &Adapter::getAdapterID>(to, at);
}

void getVantryAdapterOverallStatusString(char* to, int at) { adapters.overallStatus(to, at); }

void getVantryAdapterInitiatorIDs(char* to, int at) {
    raid::flat::initiatorIDs(to, adapters.at(at));
}
