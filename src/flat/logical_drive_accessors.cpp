#include "flat/accessors.h"
#include "flat/lists.h"

using namespace raid::flat;

int getRAIDLogicalDriveCount() { return count(RAIDLogicalDriveList); }

int getRAIDLogicalDriveState(int position) {
    return number<&RAIDLogicalDrive::getState>(RAIDLogicalDriveList, position);
}
int getRAIDLogicalDriveShared(int position) {
    return number<&RAIDLogicalDrive::getShared>(RAIDLogicalDriveList, position);
}
int getRAIDLogicalDriveParitySpace(int position) {
    return number<&RAIDLogicalDrive::getParitySpace>(RAIDLogicalDriveList, position);
}
int getRAIDLogicalDriveDataSpace(int position) {
    return number<&RAIDLogicalDrive::getDataSpace>(RAIDLogicalDriveList, position);
}
int getRAIDLogicalDriveArrayID(int position) {
    return number<&RAIDLogicalDrive::getArrayID>(RAIDLogicalDriveList, position);
}
int getRAIDLogicalDriveAdapterID(int position) {
    return number<&RAIDLogicalDrive::getAdapterID>(RAIDLogicalDriveList, position);
}
int getRAIDLogicalDriveLogicalDriveID(int position) {
    return number<&RAIDLogicalDrive::getLogicalDriveID>(RAIDLogicalDriveList, position);
}
int getRAIDLogicalDriveRaidLevel(int position) {
    return number<&RAIDLogicalDrive::getRaidLevel>(RAIDLogicalDriveList, position);
}
int getRAIDLogicalDriveWriteCacheMode(int position) {
    return number<&RAIDLogicalDrive::getWriteCacheMode>(RAIDLogicalDriveList, position);
}
int getRAIDLogicalDriveBlocked(int position) {
    return number<&RAIDLogicalDrive::getBlocked>(RAIDLogicalDriveList, position);
}
int getRAIDLogicalDriveStripeUnitSize(int position) {
    return number<&RAIDLogicalDrive::getStripeUnitSize>(RAIDLogicalDriveList, position);
}
int getRAIDLogicalDriveType(int position) {
    return number<&RAIDLogicalDrive::getType>(RAIDLogicalDriveList, position);
}

int getRAIDLogicalDriveArrayIDString(char* destination, int position) {
    return displayName<"Logical Drive %d", &RAIDLogicalDrive::getArrayID>(
        destination, RAIDLogicalDriveList, position);
}
int getRAIDLogicalDriveAdapterIDString(char* destination, int position) {
    return displayName<"Logical Drive %d", &RAIDLogicalDrive::getAdapterID>(
        destination, RAIDLogicalDriveList, position);
}
int getRAIDLogicalDriveLogicalDriveIDString(char* destination, int position) {
    return displayName<"Logical Drive %d", &RAIDLogicalDrive::getLogicalDriveID>(
        destination, RAIDLogicalDriveList, position);
}

void getRAIDLogicalDriveOverallStatusString(char* destination, int position) {
    overallStatus(destination, RAIDLogicalDriveList, position);
}
