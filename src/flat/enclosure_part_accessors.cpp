#include "flat/accessors.h"
#include "flat/lists.h"

namespace {

constexpr raid::flat::Family fans(RAIDFanList);
constexpr raid::flat::Family supplies(RAIDPowerSupplyList);
constexpr raid::flat::Family sensors(RAIDTempSensorList);

}  // namespace

// The "IDString" of a part carries its enclosure's number, the "StatusString" its status number.

int getRAIDFanCount() { return fans.count(); }

int getRAIDFanStatus(int at) { return fans.number<&RAIDFan::getStatus>(at); }
int getRAIDFanEnclosureID(int at) { return fans.number<&RAIDFan::getEnclosureID>(at); }
int getRAIDFanChannelID(int at) { return fans.number<&RAIDFan::getChannelID>(at); }
int getRAIDFanAdapterID(int at) { return fans.number<&RAIDFan::getAdapterID>(at); }

int getRAIDFanStatusString(char* to, int at) {
    return fans.displayName<"Disk Drive %d", &RAIDFan::getStatus>(to, at);
}
int getRAIDFanFanIDString(char* to, int at) {
    return fans.displayName<"Disk Drive %d", &RAIDFan::getEnclosureID>(to, at);
}
int getRAIDFanChannelIDString(char* to, int at) {
    return fans.displayName<"Channel %d", &RAIDFan::getChannelID>(to, at);
}
int getRAIDFanAdapterIDString(char* to, int at) {
    return fans.displayName<"Controller %d", &RAIDFan::getAdapterID>(to, at);
}

int getRAIDPowerSupplyCount() { return supplies.count(); }

int getRAIDPowerSupplyStatus(int at) { return supplies.number<&RAIDPowerSupply::getStatus>(at); }
int getRAIDPowerSupplyEnclosureID(int at) {
    return supplies.number<&RAIDPowerSupply::getEnclosureID>(at);
}
int getRAIDPowerSupplyChannelID(int at) {
    return supplies.number<&RAIDPowerSupply::getChannelID>(at);
}
int getRAIDPowerSupplyAdapterID(int at) {
    return supplies.number<&RAIDPowerSupply::getAdapterID>(at);
}

int getRAIDPowerSupplyStatusString(char* to, int at) {
    return supplies.displayName<"Disk Drive %d", &RAIDPowerSupply::getStatus>(to, at);
}
int getRAIDPowerSupplyPowerSupplyIDString(char* to, int at) {
    return supplies.displayName<"Disk Drive %d", &RAIDPowerSupply::getEnclosureID>(to, at);
}
int getRAIDPowerSupplyChannelIDString(char* to, int at) {
    return supplies.displayName<"Channel %d", &RAIDPowerSupply::getChannelID>(to, at);
}
int getRAIDPowerSupplyAdapterIDString(char* to, int at) {
    return supplies.displayName<"Controller %d", &RAIDPowerSupply::getAdapterID>(to, at);
}

int getRAIDTempSensorCount() { return sensors.count(); }

int getRAIDTempSensorStatus(int at) { return sensors.number<&RAIDTempSensor::getStatus>(at); }
int getRAIDTempSensorEnclosureID(int at) {
    return sensors.number<&RAIDTempSensor::getEnclosureID>(at);
}
int getRAIDTempSensorChannelID(int at) { return sensors.number<&RAIDTempSensor::getChannelID>(at); }
int getRAIDTempSensorAdapterID(int at) { return sensors.number<&RAIDTempSensor::getAdapterID>(at); }

int getRAIDTempSensorStatusString(char* to, int at) {
    return sensors.displayName<"Disk Drive %d", &RAIDTempSensor::getStatus>(to, at);
}
int getRAIDTempSensorTempSensorIDString(char* to, int at) {
    return sensors.displayName<"Disk Drive %d", &RAIDTempSensor::getEnclosureID>(to, at);
}
int getRAIDTempSensorChannelIDString(char* to, int at) {
    return sensors.displayName<"Channel %d", &RAIDTempSensor::getChannelID>(to, at);
}
int getRAIDTempSensorAdapterIDString(char* to, int at) {
    return sensors.displayName<"Controller %d", &RAIDTempSensor::getAdapterID>(to, at);
}
