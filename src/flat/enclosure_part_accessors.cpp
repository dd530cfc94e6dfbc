#include "flat/accessors.h"
#include "flat/lists.h"

using namespace raid::flat;

// The "IDString" of a part carries its enclosure's number, the "StatusString" its status number.

int getRAIDFanCount() { return count(RAIDFanList); }

int getRAIDFanStatus(int position) { return number<&RAIDFan::getStatus>(RAIDFanList, position); }
int getRAIDFanEnclosureID(int position) {
    return number<&RAIDFan::getEnclosureID>(RAIDFanList, position);
}
int getRAIDFanChannelID(int position) {
    return number<&RAIDFan::getChannelID>(RAIDFanList, position);
}
int getRAIDFanAdapterID(int position) {
    return number<&RAIDFan::getAdapterID>(RAIDFanList, position);
}

int getRAIDFanStatusString(char* destination, int position) {
    return displayName<"Disk Drive %d", &RAIDFan::getStatus>(destination, RAIDFanList, position);
}
int getRAIDFanFanIDString(char* destination, int position) {
    return displayName<"Disk Drive %d", &RAIDFan::getEnclosureID>(destination, RAIDFanList,
                                                                  position);
}
int getRAIDFanChannelIDString(char* destination, int position) {
    return displayName<"Channel %d", &RAIDFan::getChannelID>(destination, RAIDFanList, position);
}
int getRAIDFanAdapterIDString(char* destination, int position) {
    return displayName<"Controller %d", &RAIDFan::getAdapterID>(destination, RAIDFanList, position);
}

int getRAIDPowerSupplyCount() { return count(RAIDPowerSupplyList); }

int getRAIDPowerSupplyStatus(int position) {
    return number<&RAIDPowerSupply::getStatus>(RAIDPowerSupplyList, position);
}
int getRAIDPowerSupplyEnclosureID(int position) {
    return number<&RAIDPowerSupply::getEnclosureID>(RAIDPowerSupplyList, position);
}
int getRAIDPowerSupplyChannelID(int position) {
    return number<&RAIDPowerSupply::getChannelID>(RAIDPowerSupplyList, position);
}
int getRAIDPowerSupplyAdapterID(int position) {
    return number<&RAIDPowerSupply::getAdapterID>(RAIDPowerSupplyList, position);
}

int getRAIDPowerSupplyStatusString(char* destination, int position) {
    return displayName<"Disk Drive %d", &RAIDPowerSupply::getStatus>(destination,
                                                                     RAIDPowerSupplyList, position);
}
int getRAIDPowerSupplyPowerSupplyIDString(char* destination, int position) {
    return displayName<"Disk Drive %d", &RAIDPowerSupply::getEnclosureID>(
        destination, RAIDPowerSupplyList, position);
}
int getRAIDPowerSupplyChannelIDString(char* destination, int position) {
    return displayName<"Channel %d", &RAIDPowerSupply::getChannelID>(destination,
                                                                     RAIDPowerSupplyList, position);
}
int getRAIDPowerSupplyAdapterIDString(char* destination, int position) {
    return displayName<"Controller %d", &RAIDPowerSupply::getAdapterID>(
        destination, RAIDPowerSupplyList, position);
}

int getRAIDTempSensorCount() { return count(RAIDTempSensorList); }

int getRAIDTempSensorStatus(int position) {
    return number<&RAIDTempSensor::getStatus>(RAIDTempSensorList, position);
}
int getRAIDTempSensorEnclosureID(int position) {
    return number<&RAIDTempSensor::getEnclosureID>(RAIDTempSensorList, position);
}
int getRAIDTempSensorChannelID(int position) {
    return number<&RAIDTempSensor::getChannelID>(RAIDTempSensorList, position);
}
int getRAIDTempSensorAdapterID(int position) {
    return number<&RAIDTempSensor::getAdapterID>(RAIDTempSensorList, position);
}

int getRAIDTempSensorStatusString(char* destination, int position) {
    return displayName<"Disk Drive %d", &RAIDTempSensor::getStatus>(destination, RAIDTempSensorList,
                                                                    position);
}
int getRAIDTempSensorTempSensorIDString(char* destination, int position) {
    return displayName<"Disk Drive %d", &RAIDTempSensor::getEnclosureID>(
        destination, RAIDTempSensorList, position);
}
int getRAIDTempSensorChannelIDString(char* destination, int position) {
    return displayName<"Channel %d", &RAIDTempSensor::getChannelID>(destination, RAIDTempSensorList,
                                                                    position);
}
int getRAIDTempSensorAdapterIDString(char* destination, int position) {
    return displayName<"Controller %d", &RAIDTempSensor::getAdapterID>(
        destination, RAIDTempSensorList, position);
}
