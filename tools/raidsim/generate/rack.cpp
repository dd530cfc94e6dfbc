#include "generate/rack.h"

#include <algorithm>
#include <optional>
#include <utility>

#include "generate/element.h"
#include "soap/envelope.h"

namespace raidsim::generate {

namespace {

constexpr int normal = 0;
constexpr int stripeKilobytes = 64;

std::string padded(int value, std::size_t width) {
    const std::string digits = std::to_string(value);
    return std::string(width - std::min(width, digits.size()), '0') + digits;
}

Element drive(const AdapterPlan& adapter, const ChannelPlan& channel, const DrivePlan& plan) {
    const bool spare = plan.state == DriveState::hotSpare;
    return Element("o:HardDrive")
        .number("overallStatus", normal)
        .number("state", plan.state)
        .number("type", plan.model.interface)
        .number("deviceID", plan.device)
        .number("adapterID", adapter.id)
        .number("channelID", channel.id)
        .text("vendor", plan.model.vendor)
        .text("model", plan.model.model)
        .text("serialNumber", plan.model.model.substr(0, 2) + padded(adapter.id, 2) +
                                  padded(channel.id, 2) + padded(plan.device, 3) + "K")
        .text("firmwareLevel", plan.model.firmware)
        .text("fruNumber", plan.model.fru)
        .number("size", plan.model.megabytes)
        .flag("smartError", false)
        .flag("writeCacheEnableSupported", true)
        .number("writeCacheEnable", 0)
        .flag("hasOSPartition", plan.holdsOs)
        .number("arrayUniqueID", 0)
        .flag("isAssignedHotSpare", false)
        .flag("isGlobalHotSpare", spare)
        .number("hotSpareType", spare ? HotSpareType::global : HotSpareType::none);
}

// What an array tells about a member: where it is and how it does.
Element member(const AdapterPlan& adapter, const ChannelPlan& channel, const DrivePlan& plan) {
    return Element("o:HardDrive")
        .number("overallStatus", normal)
        .number("state", plan.state)
        .number("deviceID", plan.device)
        .number("adapterID", adapter.id)
        .number("channelID", channel.id)
        .number("size", plan.model.megabytes);
}

Element part(const char* xsiType, int index, const char* valueField, int value) {
    return Element(xsiType).number("index", index).number(valueField, value);
}

Element enclosure(const AdapterPlan& adapter, const ChannelPlan& channel,
                  const EnclosurePlan& plan) {
    Element made("o:Enclosure");
    made.number("overallStatus", normal)
        .number("state", 1)
        .number("type", channel.interface)
        .number("deviceID", plan.device)
        .number("adapterID", adapter.id)
        .number("channelID", channel.id)
        .number("logicalID", plan.logicalId)
        .number("arrayID", -1)
        .text("vendor", plan.vendor)
        .text("model", plan.model)
        .text("serialNumber",
              "EN" + padded(adapter.id, 2) + padded(channel.id, 2) + padded(plan.device, 3) + "C")
        .text("firmwareLevel", "1.07")
        .text("fruNumber", "41N5512")
        .text("interfaceType", channel.interface == Interface::parallelScsi ? "SAF-TE" : "SES-2");
    for (int i = 0; i < plan.fans; ++i)
        made.child("ac:fan", part("o:Fan", i, "status", normal));
    for (int i = 0; i < plan.supplies; ++i)
        made.child("ac:powerSupply", part("o:PowerSupply", i, "status", normal));
    for (int i = 0; i < plan.sensors; ++i)
        made.child("ac:tempSensor", part("o:TempSensor", i, "status", normal));
    for (std::size_t i = 0; i < plan.slots.size(); ++i) {
        made.child("ac:deviceSlotID",
                   part("o:DeviceSlotID", static_cast<int>(i), "slotID", plan.slots[i]));
    }
    return made;
}

Element channelFields(const AdapterPlan& adapter, const ChannelPlan& plan) {
    return Element("o:Channel")
        .number("overallStatus", normal)
        .number("channelID", plan.id)
        .number("adapterID", adapter.id)
        .number("initiatorID", 7)
        .number("type", plan.interface)
        .number("transferSpeed", plan.megabytesPerSecond);
}

Element physicalDrives(const AdapterPlan& adapter) {
    Element made("o:PhysicalDrives");
    made.number("overallStatus", normal);
    for (const ChannelPlan& plan : adapter.channels) {
        Element channel = channelFields(adapter, plan);
        for (const DrivePlan& each : plan.drives)
            channel.child("ac:hardDrive", drive(adapter, plan, each));
        for (const EnclosurePlan& each : plan.enclosures)
            channel.child("ac:enclosure", enclosure(adapter, plan, each));
        made.child("ac:channel", std::move(channel));
    }
    return made;
}

Element hotSpares(const AdapterPlan& adapter) {
    Element made("o:HotSpareDrives");
    made.number("overallStatus", normal);
    for (const ChannelPlan& channel : adapter.channels) {
        for (const DrivePlan& each : channel.drives) {
            if (each.state == DriveState::hotSpare)
                made.child("ac:hardDrive", drive(adapter, channel, each));
        }
    }
    return made;
}

Element logicalDrives(const AdapterPlan& adapter, const std::vector<const LogicalPlan*>& plans) {
    Element made("o:LogicalDrives");
    made.number("overallStatus", normal);
    for (const LogicalPlan* const plan : plans) {
        made.child("ac:logicalDrive", Element("o:LogicalDrive")
                                          .number("overallStatus", normal)
                                          .number("state", 0)
                                          .number("type", 0)
                                          .number("adapterID", adapter.id)
                                          .number("logicalDriveID", plan->id)
                                          .number("logicalID", plan->id)
                                          .text("name", plan->name)
                                          .number("raidLevel", plan->raidLevel)
                                          .number("dataSpace", plan->dataMegabytes)
                                          .number("paritySpace", plan->parityMegabytes)
                                          .number("stripeUnitSize", stripeKilobytes)
                                          .number("readCacheMode", 1)
                                          .number("writeCacheMode", adapter.battery ? 1 : 0)
                                          .number("r5eeSubstate", 0)
                                          .flag("blocked", false)
                                          .flag("shared", false)
                                          .child("ac:chunks", Element("o:Chunks")));
    }
    return made;
}

std::vector<const LogicalPlan*> pointers(const std::vector<LogicalPlan>& plans) {
    std::vector<const LogicalPlan*> made;
    for (const LogicalPlan& plan : plans)
        made.push_back(&plan);
    return made;
}

bool contains(const ArrayPlan& plan, int channel, int device) {
    return std::ranges::any_of(plan.members, [&](const Place& place) {
        return place.channel == channel && place.device == device;
    });
}

// Calls use(channel, drive) for every member, in the adapter's order.
template <typename Use>
void forEachMember(const AdapterPlan& adapter, const ArrayPlan& plan, Use use) {
    for (const ChannelPlan& channel : adapter.channels) {
        for (const DrivePlan& each : channel.drives) {
            if (contains(plan, channel.id, each.device))
                use(channel, each);
        }
    }
}

int sizeOf(const AdapterPlan& adapter, const ArrayPlan& plan) {
    int total = 0;
    forEachMember(adapter, plan, [&](const ChannelPlan&, const DrivePlan& each) {
        total += each.model.megabytes;
    });
    return total;
}

int usedBy(const std::vector<LogicalPlan>& plans) {
    int total = 0;
    for (const LogicalPlan& plan : plans)
        total += plan.dataMegabytes + plan.parityMegabytes;
    return total;
}

void addMembers(Element& array, const AdapterPlan& adapter, const ArrayPlan& plan) {
    if (plan.listsMembersDirectly) {
        forEachMember(adapter, plan, [&](const ChannelPlan& channel, const DrivePlan& each) {
            array.child("ac:hardDrive", member(adapter, channel, each));
        });
        return;
    }
    Element physical("o:PhysicalDrives");
    physical.number("overallStatus", normal);
    for (const ChannelPlan& channel : adapter.channels) {
        std::optional<Element> listed;
        for (const DrivePlan& each : channel.drives) {
            if (!contains(plan, channel.id, each.device))
                continue;
            if (!listed)
                listed = channelFields(adapter, channel);
            listed->child("ac:hardDrive", member(adapter, channel, each));
        }
        if (listed)
            physical.child("ac:channel", *std::move(listed));
    }
    array.child("ac:physicalDrives", std::move(physical));
}

Element arrayFields(const AdapterPlan& adapter, const char* xsiType, int id,
                    const std::string& name, const std::string& owner, int type) {
    return Element(xsiType)
        .number("overallStatus", normal)
        .number("arrayID", id)
        .number("adapterID", adapter.id)
        .text("name", name)
        .text("preferredOwner", owner)
        .number("type", type)
        .number("stripeSize", stripeKilobytes);
}

Element basicArray(const AdapterPlan& adapter, const ArrayPlan& plan, bool inSpanned) {
    const int size = sizeOf(adapter, plan);
    Element made = arrayFields(adapter, "o:BasicArray", plan.id, plan.name, plan.owner, 0);
    made.flag("isSubArray", inSpanned)
        .number("size", size)
        .number("freeSpace", inSpanned ? 0 : std::max(0, size - usedBy(plan.logicals)));
    made.child("ac:logicalDrives", logicalDrives(adapter, pointers(plan.logicals)));
    addMembers(made, adapter, plan);
    return made;
}

Element spannedArray(const AdapterPlan& adapter, const SpannedPlan& plan) {
    Element inner("o:Arrays");
    inner.number("overallStatus", normal);
    int size = 0;
    for (const ArrayPlan& each : plan.arrays) {
        size += sizeOf(adapter, each);
        inner.child("ac:basicArray", basicArray(adapter, each, true));
    }
    Element made = arrayFields(adapter, "o:SpannedArray", plan.id, plan.name, "", 1);
    made.number("size", size).number("freeSpace", std::max(0, size - usedBy(plan.logicals)));
    made.child("ac:logicalDrives", logicalDrives(adapter, pointers(plan.logicals)));
    made.child("ac:arrays", std::move(inner));
    return made;
}

Element arrays(const AdapterPlan& adapter) {
    Element made("o:Arrays");
    made.number("overallStatus", normal);
    for (const ArrayPlan& plan : adapter.arrays)
        made.child("ac:basicArray", basicArray(adapter, plan, false));
    for (const SpannedPlan& plan : adapter.spanned)
        made.child("ac:spannedArray", spannedArray(adapter, plan));
    return made;
}

std::vector<const LogicalPlan*> allLogicals(const AdapterPlan& adapter) {
    std::vector<const LogicalPlan*> made = pointers(adapter.logicals);
    const auto add = [&](const auto& plans) {
        for (const auto& plan : plans)
            std::ranges::move(pointers(plan.logicals), std::back_inserter(made));
    };
    add(adapter.arrays);
    add(adapter.spanned);
    std::ranges::sort(made, {}, &LogicalPlan::id);
    return made;
}

Element adapterFields(const AdapterPlan& plan) {
    return Element(plan.xsiType)
        .number("overallStatus", normal)
        .number("adapterStatus", normal)
        .number("adapterID", plan.id)
        .text("typeName", plan.typeName)
        .number("type", plan.interface)
        .text("serialNumber", "AD" + padded(1000 * plan.id + 417, 6))
        .text("biosVersion", "4.11.02")
        .text("firmwareVersion", "5.20.01")
        .text("driverVersion", "2.4.9")
        .text("fruNumber", "39R" + padded(8800 + plan.id, 4))
        .text("partNumber", "13N" + padded(2190 + plan.id, 4))
        .text("batteryFruNumber", plan.battery ? "25R8076" : "")
        .number("physicalSlot", plan.physicalSlot)
        .number("pciBus", 2 + plan.physicalSlot)
        .number("pciDevice", 1)
        .number("pciFunction", 0)
        .number("pciVendorID", 60001)
        .number("pciDeviceID", 500 + plan.id)
        .number("installedMemorySize", plan.memoryMegabytes)
        .number("stripeUnitSize", stripeKilobytes)
        .number("rebuildRate", 2)
        .number("alarmStatus", AlarmStatus::on)
        .flag("batteryCacheInstalled", plan.battery)
        .number("batteryStatus", plan.battery ? BatteryStatus::good : BatteryStatus::none)
        .number("batteryCacheErrorCode", 0)
        .flag("hotSwapRebuild", true)
        .flag("copyBack", false)
        .flag("simulated", true)
        .flag("dataScrubbing", true)
        .flag("readAhead", true)
        .flag("adaptiveReadAhead", false)
        .flag("clustering", false)
        .flag("unattended", false)
        .flag("limitedBIOSCompatibility", false)
        .flag("autoSynchronization", true);
}

Element adapter(const AdapterPlan& plan) {
    Element made = adapterFields(plan);
    made.child("ac:limits", Element("o:Limits").number("maxArrays", 32).number("maxDrives", 255));
    made.child("ac:arrays", arrays(plan));
    made.child("ac:logicalDrives", logicalDrives(plan, allLogicals(plan)));
    made.child("ac:hotSpareDrives", hotSpares(plan));
    made.child("ac:physicalDrives", physicalDrives(plan));
    return made;
}

}  // namespace

xml::Tree document(const SystemPlan& plan) {
    Element system("o:System");
    system.text("name", plan.name)
        .text("os", plan.os)
        .text("osVersion", plan.osVersion)
        .text("agentVersion", "7.30.12")
        .number("overallStatus", normal);
    for (const AdapterPlan& each : plan.adapters)
        system.child("ac:adapter", adapter(each));
    xml::Tree content;
    xml::addChild(content, "ac:system").swap(system.get());
    return soap::envelope("m:getConfigResponse", std::move(content));
}

}  // namespace raidsim::generate
