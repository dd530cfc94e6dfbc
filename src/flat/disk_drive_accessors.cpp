#include "flat/accessors.h"
#include "flat/lists.h"
#include "model/channels_and_drives_vocabulary.h"

namespace {

using Drive = RAIDHardDrive;
constexpr raid::flat::Family drives(RAIDDiskDriveList);

}  // namespace

int getRAIDDiskDriveCount() { return drives.count(); }

int getRAIDDiskDriveChannelID(int at) { return drives.number<&Drive::getChannelID>(at); }
int getRAIDDiskDriveAdapterID(int at) { return drives.number<&Drive::getAdapterID>(at); }
int getRAIDDiskDriveArrayID(int at) { return drives.number<&Drive::getArrayID>(at); }
int getRAIDDiskDriveArrayUniqueID(int at) { return drives.number<&Drive::getArrayUniqueID>(at); }
int getRAIDDiskDriveHasOSPartition(int at) { return drives.number<&Drive::getHasOSPartition>(at); }
int getRAIDDiskDriveSize(int at) { return drives.number<&Drive::getSize>(at); }
int getRAIDDiskDriveWriteCacheEnable(int at) {
    return drives.number<&Drive::getWriteCacheEnable>(at);
}
int getRAIDDiskDriveWriteCachEnableSupported(int at) {
    return drives.number<&Drive::getWriteCacheEnableSupported>(at);
}
int getRAIDDiskDriveState(int at) { return drives.number<&Drive::getState>(at); }
int getRAIDDiskDriveSmartError(int at) { return drives.number<&Drive::getSmartError>(at); }
int getRAIDDiskDriveType(int at) { return drives.number<&Drive::getType>(at); }

void getRAIDDiskDriveSerialNumber(char* to, int at) { drives.text<"as:serialNumber">(to, at); }
void getRAIDDiskDriveModel(char* to, int at) { drives.text<"as:model">(to, at); }
void getRAIDDiskDriveFruNumber(char* to, int at) { drives.text<"as:fruNumber">(to, at); }
void getRAIDDiskDriveVendor(char* to, int at) { drives.text<"as:vendor">(to, at); }
void getRAIDDiskDriveFirmwareLevel(char* to, int at) { drives.text<"as:firmwareLevel">(to, at); }

int getRAIDDiskDriveDiskDriveIDString(char* to, int at) {
    return drives.displayName<"Disk Drive %d", &Drive::getArrayUniqueID>(to, at);
}
int getRAIDDiskDriveChannelIDString(char* to, int at) {
    return drives.displayName<"Channel %d", &Drive::getChannelID>(to, at);
}
int getRAIDDiskDriveAdapterIDString(char* to, int at) {
    return drives.displayName<"Controller %d", &Drive::getAdapterID>(to, at);
}

void getRAIDDiskDriveOverallStatusString(char* to, int at) { drives.overallStatus(to, at); }
