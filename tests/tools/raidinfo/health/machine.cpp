#include "machine.h"

#include <algorithm>
#include <map>
#include <stdexcept>
#include <string>
#include <utility>

#include "sample.h"

namespace raidinfo::test {
namespace {

constexpr std::size_t driveCount = 4;
constexpr std::size_t memberCount = 3;
constexpr int online = 1;
constexpr int hotSpare = 2;

const std::string normal = "Normal";

}  // namespace

Machine::Machine() : adapters{"adapters", {}} {
    add(KindId::pellionAdapter, {{"adapter_id", 1},
                                 {"overall_status", normal},
                                 {"battery_status", 1},
                                 {"serial_number", std::string{"AD001417"}}});
    add(KindId::channel, {{"channel_id", 1}});
    for (std::size_t device = 0; device < driveCount; ++device) {
        add(KindId::diskDrive, {{"channel_id", 1},
                                {"overall_status", normal},
                                {"state", device < memberCount ? online : hotSpare},
                                {"size", 70006},
                                {"serial_number", "QS" + std::to_string(device)}});
    }
    add(KindId::enclosure, {{"device_id", 8}, {"overall_status", normal}, {"state", 1}});
    add(KindId::fan, {});
    add(KindId::powerSupply, {});
    add(KindId::temperatureSensor, {});
    add(KindId::array, {});
    add(KindId::logicalDrive,
        {{"overall_status", normal}, {"raid_level", 5}, {"write_cache_mode", 1}});

    Node channel = node(KindId::channel, 0, "Channel 1");
    channel.groups = {drives(), enclosures()};
    Node root = node(
        KindId::pellionAdapter, 0, "Pellion adapter 1",
        {{"family", std::string{"pellion"}}, {"adapter_type", std::string{"o:PellionAdapter"}}});
    root.groups = {
        {"channels", {channel}}, arrays(), {"spanned_arrays", {}}, {"logical_drives", {}}};
    adapters.nodes = {root};
}

void Machine::add(KindId kind, const std::map<std::string_view, Value>& values) {
    snapshot.of(kind).push_back(sample(kindOf(kind), values));
}

Node Machine::node(KindId kind, std::size_t position, const char* title, Extras extras) const {
    const std::string words = title;
    return {.title = words,
            .number = std::stoi(words.substr(words.rfind(' '))),
            .extras = std::move(extras),
            .kind = &kindOf(kind),
            .record = &snapshot.of(kind).at(position),
            .position = position};
}

Group Machine::drives() const {
    Group group{"disk_drives", {}};
    for (std::size_t device = 0; device < driveCount; ++device) {
        group.nodes.push_back(
            node(KindId::diskDrive, device, ("Disk drive " + std::to_string(device)).c_str(),
                 {{"device_id", static_cast<int>(device)}, {"hot_spare", device >= memberCount}}));
    }
    return group;
}

Group Machine::enclosures() const {
    Node enclosure = node(KindId::enclosure, 0, "Enclosure 8");
    enclosure.groups = {
        {"fans", {node(KindId::fan, 0, "Fan 0", {{"index", 0}})}},
        {"power_supplies", {node(KindId::powerSupply, 0, "Power supply 0", {{"index", 0}})}},
        {"temperature_sensors",
         {node(KindId::temperatureSensor, 0, "Temperature sensor 0", {{"index", 0}})}}};
    return {"enclosures", {enclosure}};
}

Group Machine::arrays() const {
    Group members{"disk_drives", {}};
    for (std::size_t device = 0; device < memberCount; ++device) {
        members.nodes.push_back({.title = "Disk drive " + std::to_string(device),
                                 .extras = {{"channel_id", 1},
                                            {"device_id", static_cast<int>(device)},
                                            {"present", true}},
                                 .kind = &kindOf(KindId::diskDrive),
                                 .position = device,
                                 .inFull = false});
    }
    Node array = node(KindId::array, 0, "Array 0");
    array.groups = {{"logical_drives", {node(KindId::logicalDrive, 0, "Logical drive 0")}},
                    members};
    return {"arrays", {array}};
}

void Machine::set(KindId kind, std::size_t position, std::string_view field, Value value) {
    const auto index = fieldIndex(kindOf(kind), field);
    if (index < 0) {
        throw std::invalid_argument{"no field " + std::string{field}};
    }
    snapshot.of(kind).at(position).at(static_cast<std::size_t>(index)) = std::move(value);
}

void Machine::setExtra(Node& node, std::string_view key, Value value) {
    const auto found =
        std::ranges::find_if(node.extras, [key](const auto& extra) { return extra.first == key; });
    if (found == node.extras.end()) {
        throw std::invalid_argument{"nothing is known as " + std::string{key}};
    }
    found->second = std::move(value);
}

Node& Machine::adapter() { return adapters.nodes.at(0); }

Node& Machine::drive(std::size_t position) {
    return adapter().groups.at(0).nodes.at(0).groups.at(0).nodes.at(position);
}

Node& Machine::member(std::size_t index) {
    return adapter().groups.at(1).nodes.at(0).groups.at(1).nodes.at(index);
}

Change setting(KindId kind, std::size_t position, std::string_view field, const Value& value) {
    return [=](Machine& machine) { machine.set(kind, position, field, value); };
}

Change all(std::vector<Change> changes) {
    return [changes = std::move(changes)](Machine& machine) {
        for (const Change& change : changes) {
            change(machine);
        }
    };
}

}  // namespace raidinfo::test
