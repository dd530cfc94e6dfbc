#include "model/array_members.h"

#include "model/navigation.h"

namespace raid {
namespace {

std::uint64_t placeOf(int channel, int device) {
    return std::uint64_t{static_cast<std::uint32_t>(channel)} << 32U |
           static_cast<std::uint32_t>(device);
}

template <class Map>
std::optional<int> find(const Map& map, typename Map::key_type key) {
    const auto found = map.find(key);
    return found == map.end() ? std::nullopt : std::optional(found->second);
}

}  // namespace

ArrayMembers::ArrayMembers(const RAIDAdapter& adapter) {
    for (const auto& array : Navigation::basicArrays(adapter)) {
        for (const auto& channel : Navigation::channels(array)) {
            for (const auto& drive : Navigation::hardDrives(channel)) {
                arrayOfDrive[placeOf(channel.getChannelID(), drive.getDeviceID())] =
                    array.getArrayID();
            }
        }
        for (const auto& drive : Navigation::logicalDrives(array)) {
            arrayOfLogicalDrive[drive.getLogicalDriveID()] = array.getArrayID();
        }
    }
}

std::optional<int> ArrayMembers::arrayOf(const RAIDHardDrive& drive) const {
    return find(arrayOfDrive, placeOf(drive.getChannelID(), drive.getDeviceID()));
}

std::optional<int> ArrayMembers::arrayOf(const RAIDLogicalDrive& drive) const {
    return find(arrayOfLogicalDrive, drive.getLogicalDriveID());
}

}  // namespace raid
