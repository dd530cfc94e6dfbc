#include "inventory/structure.h"

#include <algorithm>
#include <array>
#include <map>
#include <set>
#include <utility>

#include "exit_status.h"
#include "model/system_and_adapter.h"
#include "text/decoded.h"
#include "text/printable.h"

namespace raidinfo {
namespace {

using DriveAddress = std::pair<int, int>;  ///< channel, device

/// Whose records the library publishes among those of which family.
struct Family {
    std::string_view adapterType;
    KindId kind;
};

constexpr auto families = std::to_array<Family>({
    {"o:PellionAdapter", KindId::pellionAdapter},
    {"o:MirrelAdapter", KindId::pellionAdapter},
    {"o:DorvelAdapter", KindId::vantryAdapter},
    {"o:LSIAdapter", KindId::lsiAdapter},
});

std::string numbered(KindId id, int number) {
    return std::string{kindOf(id).singular} + " " + std::to_string(number);
}

Group groupOf(KindId id, std::vector<Node> nodes) { return {kindOf(id).key, std::move(nodes)}; }

/// Hands out the published records one after another, in the order in which the library publishes
/// them: that of the model.
class Publication {
public:
    explicit Publication(const Snapshot& published) : snapshot{published} {}

    Node next(KindId id, int number) {
        const std::size_t position = positions[static_cast<std::size_t>(id)]++;
        const Records& records = snapshot.of(id);
        if (position >= records.size()) {
            throw Failure{ExitStatus::internalError,
                          "the library's lists do not match its configuration model"};
        }
        return {.title = numbered(id, number),
                .number = number,
                .kind = &kindOf(id),
                .record = &records[position],
                .position = position};
    }

private:
    const Snapshot& snapshot;
    std::array<std::size_t, static_cast<std::size_t>(KindId::event)> positions{};
};

/// Builds the tree of one adapter.
class AdapterWalk {
public:
    AdapterWalk(Publication& lists, const RAIDAdapter& walked)
        : publication{lists}, adapter{walked} {}

    Node node() {
        Node root = heading();
        // In the order of publication.
        Group channels = groupOf(KindId::channel, channelNodes());
        readLogicalDrives();
        std::vector<Group> arrays = arrayGroups(adapter.getArrays(), Depth::published);
        root.groups.push_back(std::move(channels));
        std::ranges::move(arrays, std::back_inserter(root.groups));
        root.groups.push_back(groupOf(KindId::logicalDrive, logicalDrivesOutsideArrays()));
        return root;
    }

private:
    /// The library publishes the adapter's arrays and the basic arrays of its spanned arrays, but
    /// nothing of a spanned array inside a spanned array.
    enum class Depth : std::uint8_t { published, members, unpublished };

    Node heading() {
        const int id = adapter.getAdapterID();
        const std::string type = adapter.getAdapterType();
        const auto family = std::ranges::find(families, type, &Family::adapterType);
        if (family == families.end()) {
            return {.title = "Adapter " + std::to_string(id),
                    .number = id,
                    .extras = {{"family", Unknown{}},
                               {"adapter_type", decoded(type)},
                               {"adapter_id", id}},
                    .remark = "unknown type \"" + printable(decoded(type)) + "\""};
        }
        Node node = publication.next(family->kind, id);
        node.extras = {{"family", std::string{familyName(family->kind)}}, {"adapter_type", type}};
        return node;
    }

    std::vector<Node> channelNodes() {
        std::set<DriveAddress> hotSpares;
        for (const RAIDHardDrive& spare : adapter.getHotsparedrives().getHardDrive()) {
            hotSpares.emplace(spare.getChannelID(), spare.getDeviceID());
        }
        std::vector<Node> nodes;
        for (const RAIDChannel& channel : adapter.getPhysicaldrives()) {
            Node node = publication.next(KindId::channel, channel.getChannelID());
            std::vector<Node> disks;
            for (const RAIDHardDrive& drive : channel.getHardDrive()) {
                const DriveAddress address{drive.getChannelID(), drive.getDeviceID()};
                const bool spare = hotSpares.contains(address) ||
                                   drive.getIsGlobalHotSpare() != 0 ||
                                   drive.getIsAssignedHotSpare() != 0;
                disks.push_back(publication.next(KindId::diskDrive, drive.getDeviceID()));
                disks.back().extras = {{"device_id", drive.getDeviceID()}, {"hot_spare", spare}};
                disks.back().remark = spare ? "hot spare" : "";
                drives.try_emplace(address, disks.back().position);
            }
            std::vector<Node> enclosures;
            for (const RAIDEnclosureDevice& enclosure : channel.getEnclosureDevice()) {
                enclosures.push_back(enclosureNode(enclosure));
            }
            node.groups = {groupOf(KindId::diskDrive, std::move(disks)),
                           groupOf(KindId::enclosure, std::move(enclosures))};
            nodes.push_back(std::move(node));
        }
        return nodes;
    }

    Node enclosureNode(const RAIDEnclosureDevice& enclosure) {
        Node node = publication.next(KindId::enclosure, enclosure.getDeviceID());
        const auto add = [this, &node](KindId id, const auto& parts) {
            std::vector<Node> nodes;
            for (const auto& part : parts) {
                nodes.push_back(publication.next(id, part.getIndex()));
                nodes.back().extras = {{"index", part.getIndex()}};
            }
            node.groups.push_back(groupOf(id, std::move(nodes)));
        };
        add(KindId::fan, enclosure.getFans());
        add(KindId::powerSupply, enclosure.getPowerSupplys());
        add(KindId::temperatureSensor, enclosure.getTempSensors());
        return node;
    }

    void readLogicalDrives() {
        for (const RAIDLogicalDrive& drive : adapter.getLogicaldrives()) {
            const int id = drive.getLogicalDriveID();
            logicalDrives.push_back({id, publication.next(KindId::logicalDrive, id), false});
        }
    }

    std::vector<Node> logicalDrivesOutsideArrays() const {
        std::vector<Node> nodes;
        for (const AdapterLogicalDrive& drive : logicalDrives) {
            if (!drive.inArray) {
                nodes.push_back(drive.node);
            }
        }
        return nodes;
    }

    Group logicalDrivesOf(const RAIDLogicalDrives& listed) {
        std::vector<Node> nodes;
        for (const RAIDLogicalDrive& wanted : listed.getLogicalDrive()) {
            const auto found = std::ranges::find(logicalDrives, wanted.getLogicalDriveID(),
                                                 &AdapterLogicalDrive::id);
            if (found != logicalDrives.end()) {
                found->inArray = true;
                nodes.push_back(found->node);
            }
        }
        return groupOf(KindId::logicalDrive, std::move(nodes));
    }

    Node member(const DriveAddress& address) const {
        const auto& [channel, device] = address;
        const auto found = drives.find(address);
        const bool present = found != drives.end();
        return {.title = numbered(KindId::diskDrive, device),
                .extras = {{"channel_id", channel}, {"device_id", device}, {"present", present}},
                .remark = "channel " + std::to_string(channel) + (present ? "" : ", not present"),
                .kind = &kindOf(KindId::diskDrive),
                .position = present ? found->second : std::nullopt,
                .inFull = false};
    }

    Group membersOf(const RAIDBasicArray& array) const {
        std::vector<Node> nodes;
        for (const RAIDChannel& channel : array.getPhysicalDrives().getChannel()) {
            for (const RAIDHardDrive& drive : channel.getHardDrive()) {
                nodes.push_back(member({channel.getChannelID(), drive.getDeviceID()}));
            }
        }
        for (const RAIDHardDrive& drive : array.getHardDrives()) {
            nodes.push_back(member({drive.getChannelID(), drive.getDeviceID()}));
        }
        return groupOf(KindId::diskDrive, std::move(nodes));
    }

    Node arrayNode(KindId id, int number, bool published) {
        if (published) {
            return publication.next(id, number);
        }
        return {.title = numbered(id, number),
                .number = number,
                .extras = {{"array_id", number}},
                .remark = "not published"};
    }

    std::vector<Group> arrayGroups(const RAIDArrays& arrays, Depth depth) {
        std::vector<Node> basic;
        for (const RAIDBasicArray& array : arrays.getBasicArray()) {
            basic.push_back(
                arrayNode(KindId::array, array.getArrayID(), depth != Depth::unpublished));
            basic.back().groups = {logicalDrivesOf(array.getLogicalDrives()), membersOf(array)};
        }
        std::vector<Node> spanned;
        for (const RAIDSpannedArray& array : arrays.getSpannedArray()) {
            const bool published = depth == Depth::published;
            spanned.push_back(arrayNode(KindId::spannedArray, array.getArrayID(), published));
            Node& node = spanned.back();
            node.groups = {logicalDrivesOf(array.getLogicalDrives())};
            std::ranges::move(
                arrayGroups(array.getArrays(), published ? Depth::members : Depth::unpublished),
                std::back_inserter(node.groups));
        }
        return {groupOf(KindId::array, std::move(basic)),
                groupOf(KindId::spannedArray, std::move(spanned))};
    }

    struct AdapterLogicalDrive {
        int id;
        Node node;
        bool inArray;
    };

    Publication& publication;
    const RAIDAdapter& adapter;
    std::map<DriveAddress, std::optional<std::size_t>> drives;  ///< positions of the adapter's
    std::vector<AdapterLogicalDrive> logicalDrives;
};

}  // namespace

Group adapterTrees(const std::vector<RAIDAdapter>& adapters, const Snapshot& snapshot) {
    Publication publication{snapshot};
    Group trees{adaptersKey, {}};
    for (const RAIDAdapter& adapter : adapters) {
        trees.nodes.push_back(AdapterWalk{publication, adapter}.node());
    }
    return trees;
}

}  // namespace raidinfo
