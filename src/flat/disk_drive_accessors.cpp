#include "flat/accessors.h"
#include "flat/lists.h"
#include "model/channels_and_drives_vocabulary.h"

using namespace raid::flat;

int getRAIDDiskDriveCount() { return count(RAIDDiskDriveList); }

int getRAIDDiskDriveChannelID(int position) {
    return number<&RAIDHardDrive::getChannelID>(RAIDDiskDriveList, position);
}
int getRAIDDiskDriveAdapterID(int position) {
    return number<&RAIDHardDrive::getAdapterID>(RAIDDiskDriveList, position);
}
int getRAIDDiskDriveArrayID(int position) {
    return number<&RAIDHardDrive::getArrayID>(RAIDDiskDriveList, position);
}
int getRAIDDiskDriveArrayUniqueID(int position) {
    return number<&RAIDHardDrive::getArrayUniqueID>(RAIDDiskDriveList, position);
}
int getRAIDDiskDriveHasOSPartition(int position) {
    return number<&RAIDHardDrive::getHasOSPartition>(RAIDDiskDriveList, position);
}
int getRAIDDiskDriveSize(int position) {
    return number<&RAIDHardDrive::getSize>(RAIDDiskDriveList, position);
}
int getRAIDDiskDriveWriteCacheEnable(int position) {
    return number<&RAIDHardDrive::getWriteCacheEnable>(RAIDDiskDriveList, position);
}
int getRAIDDiskDriveWriteCachEnableSupported(int position) {
    return number<&RAIDHardDrive::getWriteCacheEnableSupported>(RAIDDiskDriveList, position);
}
int getRAIDDiskDriveState(int position) {
    return number<&RAIDHardDrive::getState>(RAIDDiskDriveList, position);
}
int getRAIDDiskDriveSmartError(int position) {
    return number<&RAIDHardDrive::getSmartError>(RAIDDiskDriveList, position);
}
int getRAIDDiskDriveType(int position) {
    return number<&RAIDHardDrive::getType>(RAIDDiskDriveList, position);
}

void getRAIDDiskDriveSerialNumber(char* destination, int position) {
    text<"as:serialNumber">(destination, RAIDDiskDriveList, position);
}
void getRAIDDiskDriveModel(char* destination, int position) {
    text<"as:model">(destination, RAIDDiskDriveList, position);
}
void getRAIDDiskDriveFruNumber(char* destination, int position) {
    text<"as:fruNumber">(destination, RAIDDiskDriveList, position);
}
void getRAIDDiskDriveVendor(char* destination, int position) {
    text<"as:vendor">(destination, RAIDDiskDriveList, position);
}
void getRAIDDiskDriveFirmwareLevel(char* destination, int position) {
    text<"as:firmwareLevel">(destination, RAIDDiskDriveList, position);
}

int getRAIDDiskDriveDiskDriveIDString(char* destination, int position) {
    return displayName<"Disk Drive %d", &RAIDHardDrive::getArrayUniqueID>(
        destination, RAIDDiskDriveList, position);
}
int getRAIDDiskDriveChannelIDString(char* destination, int position) {
    return displayName<"Channel %d", &RAIDHardDrive::getChannelID>(destination, RAIDDiskDriveList,
                                                                   position);
}
int getRAIDDiskDriveAdapterIDString(char* destination, int position) {
    return displayName<"Controller %d", &RAIDHardDrive::getAdapterID>(destination,
                                                                      RAIDDiskDriveList, position);
}

void getRAIDDiskDriveOverallStatusString(char* destination, int position) {
    overallStatus(destination, RAIDDiskDriveList, position);
}
