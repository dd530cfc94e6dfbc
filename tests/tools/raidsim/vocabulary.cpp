#include "vocabulary.h"

#include <map>
#include <set>

#include "state/path.h"
#include "support/files.h"

namespace raidsim::test {

namespace {

const std::map<std::string, std::set<std::string>>& vocabulary() {
    static const std::set<std::string> part{"as:index", "as:status"};
    static const std::set<std::string> array{"as:adapterID",      "as:type",      "as:stripeSize",
                                             "as:overallStatus",  "as:freeSpace", "as:size",
                                             "as:preferredOwner", "as:name",      "as:arrayID",
                                             "ac:logicalDrives"};
    const auto with = [](std::set<std::string> base, std::set<std::string> more) {
        base.merge(more);
        return base;
    };
    static const std::map<std::string, std::set<std::string>> table{
        {"ac:system",
         {"as:osVersion", "as:os", "as:overallStatus", "as:name", "as:agentVersion", "ac:adapter"}},
        {"ac:adapter",
         {"as:hotSwapRebuild",
          "as:stripeUnitSize",
          "as:batteryStatus",
          "as:copyBack",
          "as:simulated",
          "as:adapterStatus",
          "as:overallStatus",
          "as:physicalSlot",
          "as:biosVersion",
          "as:dataScrubbing",
          "as:readAhead",
          "as:firmwareVersion",
          "as:batteryCacheErrorCode",
          "as:rebuildRate",
          "as:adapterID",
          "as:clustering",
          "as:unattended",
          "as:type",
          "as:adaptiveReadAhead",
          "as:batteryCacheInstalled",
          "as:limitedBIOSCompatibility",
          "as:installedMemorySize",
          "as:alarmStatus",
          "as:typeName",
          "as:autoSynchronization",
          "as:serialNumber",
          "as:driverVersion",
          "as:fruNumber",
          "as:partNumber",
          "as:batteryFruNumber",
          "as:pciFunction",
          "as:pciDevice",
          "as:pciVendorID",
          "as:pciBus",
          "as:pciDeviceID",
          "ac:arrays",
          "ac:logicalDrives",
          "ac:hotSpareDrives",
          "ac:physicalDrives",
          "ac:progress",
          "ac:limits"}},
        {"ac:physicalDrives", {"as:overallStatus", "ac:channel"}},
        {"ac:hotSpareDrives", {"as:overallStatus", "ac:hardDrive"}},
        {"ac:channel",
         {"as:initiatorID", "as:channelID", "as:type", "as:transferSpeed", "as:overallStatus",
          "as:adapterID", "ac:hardDrive", "ac:enclosure"}},
        {"ac:hardDrive",
         {"as:firmwareLevel",
          "as:vendor",
          "as:type",
          "as:smartError",
          "as:fruNumber",
          "as:overallStatus",
          "as:state",
          "as:model",
          "as:writeCacheEnableSupported",
          "as:size",
          "as:serialNumber",
          "as:writeCacheEnable",
          "as:hasOSPartition",
          "as:arrayUniqueID",
          "as:isAssignedHotSpare",
          "as:isGlobalHotSpare",
          "as:hotSpareType",
          "as:deviceID",
          "as:adapterID",
          "as:channelID",
          "ac:progress"}},
        {"ac:enclosure",
         {"as:adapterID", "as:logicalID", "as:channelID", "as:firmwareLevel", "as:vendor",
          "as:type", "as:deviceID", "as:arrayID", "as:fruNumber", "as:overallStatus", "as:state",
          "as:model", "as:serialNumber", "as:interfaceType", "ac:fan", "ac:powerSupply",
          "ac:tempSensor", "ac:deviceSlotID"}},
        {"ac:fan", part},
        {"ac:powerSupply", part},
        {"ac:tempSensor", part},
        {"ac:deviceSlotID", {"as:index", "as:slotID"}},
        {"ac:arrays", {"as:overallStatus", "ac:basicArray", "ac:spannedArray"}},
        {"ac:basicArray", with(array, {"as:isSubArray", "ac:physicalDrives", "ac:hardDrive"})},
        {"ac:spannedArray", with(array, {"ac:arrays"})},
        {"ac:logicalDrives", {"as:overallStatus", "ac:logicalDrive"}},
        {"ac:logicalDrive",
         {"as:overallStatus", "as:type", "as:stripeUnitSize", "as:blocked", "as:writeCacheMode",
          "as:raidLevel", "as:logicalDriveID", "as:dataSpace", "as:paritySpace", "as:shared",
          "as:state", "as:r5eeSubstate", "as:name", "as:readCacheMode", "as:adapterID",
          "as:logicalID", "ac:chunks", "ac:progress"}},
    };
    return table;
}

const std::set<std::string> passedOver{"ac:chunks", "ac:limits", "ac:progress"};

void collectUnknown(const std::string& name, const xml::Tree& element,
                    std::vector<std::string>& unknown) {
    if (name.starts_with("as:") || passedOver.contains(name))
        return;
    const auto known = vocabulary().find(name);
    if (known == vocabulary().end() || !element.data().empty()) {
        unknown.push_back(name);
        return;
    }
    for (const auto& [childName, child] : element) {
        if (childName == xml::attributesKey)
            continue;
        if (!known->second.contains(childName))
            unknown.push_back(name + "/" + childName);
        collectUnknown(childName, child, unknown);
    }
}

}  // namespace

std::string example(const std::string& name) {
    return raid::test::readFile(std::string(RAIDSIM_EXAMPLES) + "/" + name);
}

std::vector<std::string> unknownIn(const Document& document) {
    std::vector<std::string> unknown;
    collectUnknown("ac:system", document.system(), unknown);
    return unknown;
}

std::vector<std::string> values(Document& document, std::string_view path,
                                const std::string& field) {
    std::vector<std::string> found;
    for (const Match& match : findAll(document.edit(), Path::parse(path)))
        found.push_back(xml::textOf(*match.node, "as:" + field));
    return found;
}

std::size_t count(Document& document, std::string_view path) {
    return findAll(document.edit(), Path::parse(path)).size();
}

}  // namespace raidsim::test
