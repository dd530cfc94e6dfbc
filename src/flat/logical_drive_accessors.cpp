#include "flat/accessors.h"
#include "flat/lists.h"

namespace {

using Drive = RAIDLogicalDrive;
constexpr raid::flat::Family drives(RAIDLogicalDriveList);

}  // namespace

int getRAIDLogicalDriveCount() { return drives.count(); }

int getRAIDLogicalDriveState(int at) { return drives.number<&Drive::getState>(at); }
int getRAIDLogicalDriveShared(int at) { return drives.number<&Drive::getShared>(at); }
int getRAIDLogicalDriveParitySpace(int at) { return drives.number<&Drive::getParitySpace>(at); }
int getRAIDLogicalDriveDataSpace(int at) { return drives.number<&Drive::getDataSpace>(at); }
int getRAIDLogicalDriveArrayID(int at) { return drives.number<&Drive::getArrayID>(at); }
int getRAIDLogicalDriveAdapterID(int at) { return drives.number<&Drive::getAdapterID>(at); }
int getRAIDLogicalDriveLogicalDriveID(int at) {
    return drives.number<&Drive::getLogicalDriveID>(at);
}
int getRAIDLogicalDriveRaidLevel(int at) { return drives.number<&Drive::getRaidLevel>(at); }
int getRAIDLogicalDriveWriteCacheMode(int at) {
    return drives.number<&Drive::getWriteCacheMode>(at);
}
int getRAIDLogicalDriveBlocked(int at) { return drives.number<&Drive::getBlocked>(at); }
int getRAIDLogicalDriveStripeUnitSize(int at) {
    return drives.number<&Drive::getStripeUnitSize>(at);
}
int getRAIDLogicalDriveType(int at) { return drives.number<&Drive::getType>(at); }

int getRAIDLogicalDriveArrayIDString(char* to, int at) {
    return drives.displayName<"Logical Drive %d", &Drive::getArrayID>(to, at);
}
int getRAIDLogicalDriveAdapterIDString(char* to, int at) {
    return drives.displayName<"Logical Drive %d", &Drive::getAdapterID>(to, at);
}
int getRAIDLogicalDriveLogicalDriveIDString(char* to, int at) {
    return drives.displayName<"Logical Drive %d", &Drive::getLogicalDriveID>(to, at);
}

void getRAIDLogicalDriveOverallStatusString(char* to, int at) { drives.overallStatus(to, at); }
