#include "flat/snapshot.h"

#include <algorithm>
#include <array>
#include <optional>
#include <string_view>
#include <tuple>
#include <vector>

#include "RAIDInstrumentation.h"
#include "agent/agent_link.h"
#include "base/shared_value.h"
#include "flat/lists.h"
#include "model/navigation.h"
#include "model/numbering.h"

unsigned char refresh = 0;
unsigned char initialized = 0;

namespace {

using raid::ArrayMembers;
using raid::Navigation;

/// The twelve lists while they are filled. They are exchanged for the published ones when they are
/// whole: whatever interrupts the filling, what was published before stays.
struct Lists {
    std::vector<RAIDAdapter> pellionAdapters;
    std::vector<RAIDAdapter> lsiAdapters;
    std::vector<RAIDAdapter> vantryAdapters;
    std::vector<RAIDChannel> channels;
    std::vector<RAIDBasicArray> arrays;
    std::vector<RAIDSpannedArray> spannedArrays;
    std::vector<RAIDLogicalDrive> logicalDrives;
    std::vector<RAIDHardDrive> diskDrives;
    std::vector<RAIDEnclosureDevice> enclosureDevices;
    std::vector<RAIDFan> fans;
    std::vector<RAIDPowerSupply> powerSupplies;
    std::vector<RAIDTempSensor> tempSensors;

    auto all() noexcept {
        return std::tie(pellionAdapters, lsiAdapters, vantryAdapters, channels, arrays,
                        spannedArrays, logicalDrives, diskDrives, enclosureDevices, fans,
                        powerSupplies, tempSensors);
    }

    void exchangeWithPublished() noexcept {
        auto published =
            std::tie(PellionAdapterList, LSIAdapterList, VantryAdapterList, ChannelList,
                     RAIDArrayList, SpannedRAIDArrayList, RAIDLogicalDriveList, RAIDDiskDriveList,
                     RAIDEnclosureDeviceList, RAIDFanList, RAIDPowerSupplyList, RAIDTempSensorList);
        all().swap(published);
    }

    /// Destroys the records; the storage is kept for the next snapshot.
    void clear() noexcept {
        std::apply([](auto&... lists) { (lists.clear(), ...); }, all());
    }
};

/// Empty between two snapshots.
Lists spare;

class ClearSpare {
public:
    ClearSpare() = default;
    ClearSpare(const ClearSpare&) = delete;
    ClearSpare& operator=(const ClearSpare&) = delete;
    ~ClearSpare() { spare.clear(); }
};

/// What an adapter's type decides: the list it is published in, if any, and whether its drives and
/// logical drives get the IDs of their arrays.
struct Family {
    std::string_view type;
    std::vector<RAIDAdapter> Lists::*list;
    bool looksUpArrays;
};

constexpr std::array families{
    Family{"o:PellionAdapter", &Lists::pellionAdapters, true},
    Family{"o:DorvelAdapter", &Lists::vantryAdapters, false},
    Family{"o:MirrelAdapter", &Lists::pellionAdapters, true},
    Family{"o:LSIAdapter", &Lists::lsiAdapters, false},
};

/// The adapter itself is not published, everything below it is.
constexpr Family otherFamily{{}, nullptr, true};

Family familyOf(const RAIDAdapter& adapter) {
    const auto* const found = std::ranges::find(families, Navigation::type(adapter), &Family::type);
    return found == families.end() ? otherFamily : *found;
}

template <class Record>
void append(std::vector<Record>& list, const std::vector<Record>& records) {
    list.insert(list.end(), records.begin(), records.end());
}

/// Appends each record, with the ID of its array where one lists it.
template <class Record>
void appendNumbered(std::vector<Record>& list, const std::vector<Record>& records,
                    const ArrayMembers* members) {
    for (const auto& record : records) {
        auto& appended = list.emplace_back(record);
        if (const auto array = members != nullptr ? members->arrayOf(record) : std::nullopt) {
            appended.setArrayID(*array);
        }
    }
}

void append(Lists& lists, const RAIDEnclosureDevice& enclosure) {
    lists.enclosureDevices.push_back(enclosure);
    append(lists.fans, Navigation::fans(enclosure));
    append(lists.powerSupplies, Navigation::powerSupplies(enclosure));
    append(lists.tempSensors, Navigation::tempSensors(enclosure));
}

void append(Lists& lists, const RAIDChannel& channel, const ArrayMembers* members) {
    lists.channels.push_back(channel);
    appendNumbered(lists.diskDrives, Navigation::hardDrives(channel), members);
    for (const auto& enclosure : Navigation::enclosures(channel)) {
        append(lists, enclosure);
    }
}

/// The spanned-array index of a published array is the one that the model object carries; the
/// arrays inside spanned arrays are told from the others by their position only.
void append(Lists& lists, const RAIDSpannedArray& array) {
    lists.spannedArrays.push_back(array);
    append(lists.arrays, Navigation::basicArrays(array));
}

void append(Lists& lists, const RAIDAdapter& adapter) {
    const auto family = familyOf(adapter);
    if (family.list != nullptr) {
        (lists.*family.list).push_back(adapter);
    }
    const auto members = family.looksUpArrays ? std::optional<ArrayMembers>(adapter) : std::nullopt;
    const auto* const lookup = members ? &*members : nullptr;
    for (const auto& channel : Navigation::channels(adapter)) {
        append(lists, channel, lookup);
    }
    appendNumbered(lists.logicalDrives, Navigation::logicalDrives(adapter), lookup);
    append(lists.arrays, Navigation::basicArrays(adapter));
    for (const auto& array : Navigation::spannedArrays(adapter)) {
        append(lists, array);
    }
}

void publish(const RAIDSystem& system) {
    const ClearSpare clearing;
    for (const auto& adapter : Navigation::adapters(system)) {
        append(spare, adapter);
    }
    spare.exchangeWithPublished();
}

}  // namespace

int getConfig() {
    getRAIDXML();
    raid::base::store(refresh, static_cast<unsigned char>(0));
    if (const auto* const system = getRAIDSystem()) {
        publish(*system);
    }
    return 0;
}

int RAIDinit() {
    getConfig();
    return 0;
}

void setRefreshFlag() { raid::base::store(refresh, static_cast<unsigned char>(1)); }

int getPellionIndex(int index) { return index; }
