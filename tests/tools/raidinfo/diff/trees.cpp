#include "trees.h"

#include <algorithm>
#include <stdexcept>
#include <string>

namespace raidinfo::diff::test {
namespace {

Json blank(Shape shape) {
    switch (shape) {
        case Shape::number:
        case Shape::constant:
            return 0;
        case Shape::flag:
            return false;
        case Shape::numbers:
            return Json::array();
        case Shape::statusText:
            return "Normal";
        case Shape::text:
        case Shape::displayName:
            break;
    }
    return "";
}

Json logicalDrive(int id, int position, int array) {
    return record(KindId::logicalDrive, {{"position", position}},
                  {{"logical_drive_id", id},
                   {"adapter_id", 1},
                   {"array_id", array},
                   {"logical_drive_name", "Logical Drive " + std::to_string(array)},
                   {"raid_level", 5},
                   {"data_space", 32000}});
}

Json array(int id, int position, const Json& logicalDrives, const Json& members) {
    Json result = record(KindId::array, {{"position", position}},
                         {{"array_id", id}, {"adapter_id", 1}, {"size", 350030}});
    result["logical_drives"] = logicalDrives;
    result["disk_drives"] = members;
    return result;
}

Json part(KindId kind, int index, int position) {
    return record(kind, {{"position", position}, {"index", index}},
                  {{"adapter_id", 1}, {"channel_id", 1}, {"enclosure_id", 8}});
}

Json enclosure() {
    Json result = record(KindId::enclosure, {{"position", 0}},
                         {{"device_id", 8},
                          {"channel_id", 1},
                          {"adapter_id", 1},
                          {"model", "HV-6"},
                          {"serial_number", "EN0101008C"},
                          {"state", 1}});
    for (const KindId id : {KindId::fan, KindId::powerSupply, KindId::temperatureSensor}) {
        result[std::string{kindOf(id).key}] = {part(id, 0, 0), part(id, 1, 1)};
    }
    return result;
}

Json channel(int id, const Json& drives, const Json& enclosures) {
    Json result = record(KindId::channel, {{"position", id - 1}},
                         {{"channel_id", id}, {"adapter_id", 1}, {"transfer_speed", 320}});
    result["disk_drives"] = drives;
    result["enclosures"] = enclosures;
    return result;
}

Json& found(Json& list, const std::string& key, const Json& value) {
    const auto record =
        std::ranges::find_if(list, [&](const Json& each) { return each.at(key) == value; });
    if (record == list.end()) {
        throw std::invalid_argument{"no " + key + " " + value.dump()};
    }
    return *record;
}

}  // namespace

const CodeBook& codes() {
    static const CodeBook book = shippedCodeBook();
    return book;
}

Json record(KindId kind, const Json& extras, const Json& values) {
    Json result = extras;
    for (const Field& field : kindOf(kind).fields) {
        result[std::string{field.key}] = blank(field.shape);
    }
    for (const auto& [key, value] : values.items()) {
        result.at(key) = value;
    }
    return result;
}

Json drive(int channel, int device, int position, const std::string& serial) {
    return record(KindId::diskDrive,
                  {{"position", position}, {"device_id", device}, {"hot_spare", false}},
                  {{"channel_id", channel},
                   {"adapter_id", 1},
                   {"disk_drive_name", "Disk Drive 0"},
                   {"vendor", "QUILLON"},
                   {"serial_number", serial},
                   {"size", 70006},
                   {"state", 1}});
}

Json member(int channel, int device, int position) {
    return {
        {"position", position}, {"channel_id", channel}, {"device_id", device}, {"present", true}};
}

Json smallServer() {
    Json drives = Json::array();
    Json members = Json::array();
    for (int device = 0; device < 4; ++device) {
        drives.push_back(drive(1, device, device, "QS010100" + std::to_string(device) + "K"));
        members.push_back(member(1, device, device));
    }
    members.push_back(member(2, 0, 4));
    Json spare = drive(2, 1, 5, "QS0102001K");
    spare["hot_spare"] = true;
    spare["state"] = 2;
    Json adapter =
        record(KindId::pellionAdapter,
               {{"position", 0}, {"family", "pellion"}, {"adapter_type", "o:PellionAdapter"}},
               {{"adapter_id", 1},
                {"type_name", "Pellion 4220"},
                {"serial_number", "AD001417"},
                {"firmware_version", "5.20.01"},
                {"initiator_ids", {7, 7}}});
    adapter["channels"] = {
        channel(1, drives, Json::array({enclosure()})),
        channel(2, {drive(2, 0, 4, "QS0102000K"), spare}, Json::array()),
    };
    adapter["arrays"] =
        Json::array({array(0, 0, {logicalDrive(0, 0, 0), logicalDrive(1, 1, 0)}, members)});
    adapter["spanned_arrays"] = Json::array();
    adapter["logical_drives"] = Json::array();
    return {{"adapters", Json::array({adapter})}};
}

Json mixedServer() {
    Json tree = smallServer();
    Json spanned = record(KindId::spannedArray, {{"position", 0}},
                          {{"array_id", 5}, {"adapter_id", 1}, {"size", 700060}});
    Json unpublished = {{"array_id", 9}};
    unpublished["logical_drives"] = Json::array();
    unpublished["disk_drives"] = Json::array();
    Json inner = {{"array_id", 8}};
    inner["logical_drives"] = Json::array();
    inner["arrays"] = Json::array({unpublished});
    inner["spanned_arrays"] = Json::array();
    const Json absent = {{"channel_id", 2}, {"device_id", 9}, {"present", false}};
    spanned["logical_drives"] = Json::array({logicalDrive(2, 2, 0)});
    spanned["arrays"] = {array(6, 1, Json::array(), Json::array({member(2, 0, 4)})),
                         array(7, 2, Json::array({logicalDrive(2, 2, 0)}), Json::array({absent}))};
    spanned["spanned_arrays"] = Json::array({inner});
    adapterOf(tree)["spanned_arrays"].push_back(spanned);
    adapterOf(tree)["logical_drives"].push_back(logicalDrive(3, 3, 0));
    Json unknown = {{"family", nullptr}, {"adapter_type", "o:TalvikAdapter"}, {"adapter_id", 5}};
    for (const char* const list : {"channels", "arrays", "spanned_arrays", "logical_drives"}) {
        unknown[list] = Json::array();
    }
    Json channelOfUnknown = channel(1, Json::array({drive(1, 0, 6, "TM0501000K")}), Json::array());
    channelOfUnknown["adapter_id"] = 5;
    channelOfUnknown["disk_drives"][0]["adapter_id"] = 5;
    unknown["channels"].push_back(channelOfUnknown);
    tree["adapters"].push_back(unknown);
    return tree;
}

Json& adapterOf(Json& tree) { return tree.at("adapters").at(0); }

Json& drivesOf(Json& tree, int channel) {
    return found(adapterOf(tree).at("channels"), "channel_id", channel).at("disk_drives");
}

Json& driveOf(Json& tree, int channel, int device) {
    return found(drivesOf(tree, channel), "device_id", device);
}

Json& arrayOf(Json& tree) { return adapterOf(tree).at("arrays").at(0); }

Json& logicalDriveOf(Json& tree, int id) {
    return found(arrayOf(tree).at("logical_drives"), "logical_drive_id", id);
}

Json& enclosureOf(Json& tree) {
    return adapterOf(tree).at("channels").at(0).at("enclosures").at(0);
}

Json taken(Json& list, const std::string& key, const Json& value) {
    Json& record = found(list, key, value);
    Json result = std::move(record);
    list.erase(list.begin() + (&record - &list.front()));
    return result;
}

}  // namespace raidinfo::diff::test
