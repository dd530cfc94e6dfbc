#include "generate/sized_rack.h"

#include <algorithm>
#include <numeric>
#include <utility>

namespace raidsim::generate {

namespace {

constexpr int shelfSlots = 12;

DriveModel shelfDrive() {
    return {"OSTREL", "OX10-300", "S60G", "42D0520", Interface::sas, 286102};
}

std::vector<int> shelfSlotIds() {
    std::vector<int> made(shelfSlots);
    std::iota(made.begin(), made.end(), 1);
    return made;
}

// Adds a shelf with drives from the first device number on.
void addShelf(AdapterPlan& adapter, ChannelPlan& channel, int first, int count) {
    const int shelf = first / shelfSlots;
    const int number = static_cast<int>(adapter.arrays.size());
    ArrayPlan array{.id = number, .name = "Shelf " + std::to_string(number)};
    for (int device = first; device < first + count; ++device) {
        channel.drives.push_back({device, shelfDrive()});
        array.members.push_back({channel.id, device});
    }
    if (count > 1) {
        channel.drives.back().state = DriveState::hotSpare;
        array.members.pop_back();
    }
    const int members = static_cast<int>(array.members.size());
    array.logicals = {
        {number, "Volume " + std::to_string(number), 5, 286000 * (members - 1), 286000}};
    channel.enclosures.push_back(
        {100 + shelf, number, "HALVOR", "HV-12E", 3, 2, 2, shelfSlotIds()});
    adapter.arrays.push_back(std::move(array));
}

AdapterPlan sizedAdapter(int id, const RackSize& size) {
    const bool odd = id % 2 == 1;
    AdapterPlan adapter{.xsiType = odd ? "o:PellionAdapter" : "o:DorvelAdapter",
                        .id = id,
                        .typeName = odd ? "Pellion 8480" : "Dorvel 800",
                        .physicalSlot = id};
    adapter.interface = Interface::sas;
    adapter.memoryMegabytes = 512;
    for (int number = 0; number < size.channels; ++number) {
        ChannelPlan channel{number, Interface::sas, serialScsi, {}, {}};
        for (int first = 0; first < size.drives; first += shelfSlots)
            addShelf(adapter, channel, first, std::min(shelfSlots, size.drives - first));
        adapter.channels.push_back(std::move(channel));
    }
    return adapter;
}

}  // namespace

SystemPlan sizedRack(const RackSize& size) {
    SystemPlan plan{"rack-07", "Linux", "2.6.18-8.el5PAE", {}};
    for (int id = 1; id <= size.adapters; ++id)
        plan.adapters.push_back(sizedAdapter(id, size));
    return plan;
}

}  // namespace raidsim::generate
