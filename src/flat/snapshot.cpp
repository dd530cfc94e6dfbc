#include "flat/snapshot.h"

#include <algorithm>
#include <array>
#include <optional>
#include <string_view>
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

/// What an adapter's type decides: the list it is published in, if any, and whether its drives and
/// logical drives get the IDs of their arrays.
struct Family {
    std::string_view type;
    std::vector<RAIDAdapter>* list;
    bool looksUpArrays;
};

constexpr std::array families{
    Family{"o:PellionAdapter", &PellionAdapterList, true},
    Family{"o:DorvelAdapter", &VantryAdapterList, false},
    Family{"o:MirrelAdapter", &PellionAdapterList, true},
    Family{"o:LSIAdapter", &LSIAdapterList, false},
};

/// The adapter itself is not published, everything below it is.
constexpr Family otherFamily{{}, nullptr, true};

Family familyOf(const RAIDAdapter& adapter) {
    const auto* const found = std::ranges::find(families, Navigation::type(adapter), &Family::type);
    return found == families.end() ? otherFamily : *found;
}

template <class... Lists>
void clearAll(Lists&... lists) {
    (lists.clear(), ...);
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
        auto& published = list.emplace_back(record);
        if (const auto array = members != nullptr ? members->arrayOf(record) : std::nullopt) {
            published.setArrayID(*array);
        }
    }
}

void publish(const RAIDEnclosureDevice& enclosure) {
    RAIDEnclosureDeviceList.push_back(enclosure);
    append(RAIDFanList, Navigation::fans(enclosure));
    append(RAIDPowerSupplyList, Navigation::powerSupplies(enclosure));
    append(RAIDTempSensorList, Navigation::tempSensors(enclosure));
}

void publish(const RAIDChannel& channel, const ArrayMembers* members) {
    ChannelList.push_back(channel);
    appendNumbered(RAIDDiskDriveList, Navigation::hardDrives(channel), members);
    for (const auto& enclosure : Navigation::enclosures(channel)) {
        publish(enclosure);
    }
}

/// The spanned-array index of a published array is the one that the model object carries; the
/// arrays inside spanned arrays are told from the others by their position only.
void publish(const RAIDSpannedArray& array) {
    SpannedRAIDArrayList.push_back(array);
    append(RAIDArrayList, Navigation::basicArrays(array));
}

void publish(const RAIDAdapter& adapter) {
    const auto family = familyOf(adapter);
    if (family.list != nullptr) {
        family.list->push_back(adapter);
    }
    std::optional<ArrayMembers> members;
    if (family.looksUpArrays) {
        members.emplace(adapter);
    }
    const auto* const lookup = members ? &*members : nullptr;
    for (const auto& channel : Navigation::channels(adapter)) {
        publish(channel, lookup);
    }
    appendNumbered(RAIDLogicalDriveList, Navigation::logicalDrives(adapter), lookup);
    append(RAIDArrayList, Navigation::basicArrays(adapter));
    for (const auto& array : Navigation::spannedArrays(adapter)) {
        publish(array);
    }
}

}  // namespace

void raid::flat::publish(const RAIDSystem& system) {
    clearAll(PellionAdapterList, LSIAdapterList, VantryAdapterList, ChannelList, RAIDArrayList,
             SpannedRAIDArrayList, RAIDLogicalDriveList, RAIDDiskDriveList, RAIDEnclosureDeviceList,
             RAIDFanList, RAIDPowerSupplyList, RAIDTempSensorList);
    for (const auto& adapter : Navigation::adapters(system)) {
        ::publish(adapter);
    }
}

int getConfig() {
    getRAIDXML();
    raid::base::store(refresh, static_cast<unsigned char>(0));
    if (const auto* const system = getRAIDSystem()) {
        raid::flat::publish(*system);
    }
    return 0;
}

int RAIDinit() {
    getConfig();
    return 0;
}

void setRefreshFlag() { raid::base::store(refresh, static_cast<unsigned char>(1)); }

int getPellionIndex(int index) { return index; }
