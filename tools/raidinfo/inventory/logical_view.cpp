#include <algorithm>
#include <array>
#include <map>
#include <utility>

#include "inventory/structure.h"

namespace raidinfo {
namespace {

/// The disk drives of an adapter by their positions.
using Drives = std::map<std::size_t, const Node*>;

void gatherDrives(const Group& group, Drives& drives) {
    for (const Node& node : group.nodes) {
        if (node.inFull && node.position && node.kind == &kindOf(KindId::diskDrive)) {
            drives.emplace(*node.position, &node);
        }
        for (const Group& below : node.groups) {
            gatherDrives(below, drives);
        }
    }
}

/// A member of an array with everything that is known of the drive.
Node inFull(const Node& member, const Drives& drives) {
    const auto found = member.position ? drives.find(*member.position) : drives.end();
    if (found == drives.end()) {
        return member;
    }
    Node full = *found->second;
    full.remark = member.remark + (full.remark.empty() ? "" : ", " + full.remark);
    return full;
}

Group completed(const Group& group, const Drives& drives) {
    Group result{group.key, {}};
    for (const Node& node : group.nodes) {
        Node& copy = result.nodes.emplace_back(
            node.kind == &kindOf(KindId::diskDrive) ? inFull(node, drives) : node);
        for (Group& below : copy.groups) {
            below = completed(below, drives);
        }
    }
    return result;
}

/// The drives that stand by for the arrays.
Group hotSpares(const Drives& drives) {
    Group spares{hotSparesKey, {}};
    for (const auto& [position, drive] : drives) {
        if (std::ranges::find(drive->extras, Extras::value_type{"hot_spare", true}) !=
            drive->extras.end()) {
            spares.nodes.push_back(*drive);
        }
    }
    return spares;
}

}  // namespace

Group logicalView(const Group& adapters) {
    Group view{adapters.key, {}};
    for (const Node& adapter : adapters.nodes) {
        Drives drives;
        for (const Group& group : adapter.groups) {
            gatherDrives(group, drives);
        }
        Node& node = view.nodes.emplace_back(adapter);
        std::erase_if(node.groups,
                      [](const Group& group) { return group.key == kindOf(KindId::channel).key; });
        for (Group& group : node.groups) {
            group = completed(group, drives);
        }
        node.groups.push_back(hotSpares(drives));
    }
    return view;
}

}  // namespace raidinfo
