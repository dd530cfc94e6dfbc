#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <random>
#include <set>
#include <string>
#include <tuple>
#include <vector>

#include "diff/diff.h"
#include "trees.h"

namespace raidinfo::diff {
namespace {

using namespace test;
using Pointer = Json::json_pointer;

bool isListOfRecords(const Json& json) {
    return json.is_array() && (json.empty() || json.front().is_object());
}

// The paths of the fields of all records.
void addFields(const Json& record, const Pointer& path, std::vector<Pointer>& fields) {
    for (const auto& [key, value] : record.items()) {
        if (!isListOfRecords(value)) {
            fields.push_back(path / key);
            continue;
        }
        for (std::size_t index = 0; index < value.size(); ++index) {
            addFields(value[index], path / key / index, fields);
        }
    }
}

// Gives the field another value, wherever its record stands.
Json changedIn(const Json& tree, const Pointer& field, const std::vector<Pointer>& fields,
               const Json& value) {
    Json changed = tree;
    for (const Pointer& other : fields) {
        if (other.back() == field.back() &&
            tree[other.parent_pointer()] == tree[field.parent_pointer()]) {
            changed[other] = value;
        }
    }
    return changed;
}

bool isDisplayName(const Pointer& field) {
    return field.back().ends_with("_name") && field.back() != "type_name";
}

Json another(const Json& value) {
    if (value.is_boolean()) {
        return !value.get<bool>();
    }
    if (value.is_number_integer()) {
        return value.get<int>() + 70;
    }
    if (value.is_array()) {
        return Json::array({70});
    }
    return value.is_null() ? Json("something") : Json(value.get<std::string>() + "x");
}

void shuffleLists(Json& json, std::mt19937& random) {
    if (json.is_array() && !json.empty() && json.front().is_object()) {
        std::shuffle(json.begin(), json.end(), random);
    }
    if (json.is_structured()) {
        for (Json& child : json) {
            shuffleLists(child, random);
        }
    }
}

TEST(AnyTree, IsEqualToItself) {
    for (const Json& tree : {smallServer(), mixedServer()}) {
        EXPECT_EQ(told(changes(tree, tree, codes())), "No changes\n");
    }
}

TEST(AnyTree, IsEqualToItselfInAnotherOrder) {
    std::mt19937 random{1};
    Json tree = mixedServer();
    // What a serial number does not tell apart.
    for (Json& drive : drivesOf(tree, 1)) {
        drive["serial_number"] = "0";
    }
    Json twin = driveOf(tree, 1, 3);
    twin["position"] = 50;
    twin["size"] = 5;
    drivesOf(tree, 1).push_back(twin);
    for (int round = 0; round < 50; ++round) {
        Json shuffled = tree;
        shuffleLists(shuffled, random);
        ASSERT_EQ(told(changes(tree, shuffled, codes())), "No changes\n") << shuffled.dump(1);
    }
}

// A record with another number is told as another record.
bool isPartOfAPlace(const Pointer& field) {
    const std::set<std::string> numbers{"adapter_id", "channel_id", "device_id",       "index",
                                        "array_id",   "present",    "logical_drive_id"};
    return numbers.contains(field.back());
}

TEST(AnyChangeOfAField, IsMentioned) {
    const Json tree = mixedServer();
    std::vector<Pointer> fields;
    addFields(tree, Pointer{}, fields);
    EXPECT_GT(fields.size(), 300U);
    for (const Pointer& field : fields) {
        const Json changed = changedIn(tree, field, fields, another(tree[field]));
        const std::vector<Change> found = changes(tree, changed, codes());
        const auto names = [&](const Detail& detail) {
            return detail.key == field.back() && detail.before == tree[field] &&
                   detail.after == changed[field];
        };
        const bool isNamed = std::ranges::any_of(found, [&names](const Change& change) {
            return std::ranges::any_of(change.details, names);
        });
        if (isDisplayName(field)) {
            EXPECT_TRUE(found.empty()) << field;
        } else if (field.back() != "position") {
            EXPECT_TRUE(isNamed || (isPartOfAPlace(field) && !found.empty())) << field << "\n"
                                                                              << told(found);
        }
    }
}

TEST(AnyTree, IsEqualToItselfAtOtherPositions) {
    const Json tree = mixedServer();
    Json changed = tree;
    std::vector<Pointer> fields;
    addFields(tree, Pointer{}, fields);
    for (const Pointer& field : fields) {
        if (field.back() == "position") {
            changed[field] = tree[field].get<int>() + 10;
        }
    }
    EXPECT_NE(changed, tree);
    EXPECT_EQ(told(changes(tree, changed, codes())), "No changes\n");
}

// One edit of those that a server undergoes.
void edit(Json& tree, std::mt19937& random) {
    const auto upTo = [&random](int most) {
        return std::uniform_int_distribution<int>{0, most}(random);
    };
    const int channel = 1 + upTo(1);
    Json& drives = drivesOf(tree, channel);
    if (drives.size() < 2) {
        drives.push_back(drive(channel, 20 + upTo(5), 100 + upTo(99), ""));
        return;
    }
    Json& drive = drives[static_cast<std::size_t>(upTo(static_cast<int>(drives.size()) - 1))];
    const std::vector<std::string> states{"Normal", "Warning", "Critical"};
    switch (upTo(8)) {
        case 0:
            drive["overall_status"] = states[static_cast<std::size_t>(upTo(2))];
            break;
        case 1:
            drive["serial_number"] = "S" + std::to_string(upTo(5));
            break;
        case 2:
            drive["device_id"] = upTo(20);
            break;
        case 3:
            std::swap(drive["serial_number"], drivesOf(tree, 3 - channel)[0]["serial_number"]);
            break;
        case 4:
            drives.erase(drives.begin());
            break;
        case 5:
            drive["hot_spare"] = !drive["hot_spare"].get<bool>();
            break;
        case 6:
            drive["serial_number"] = "";
            break;
        case 7:
            drive["smart_error"] = !drive["smart_error"].get<bool>();
            drive["state"] = upTo(4);
            break;
        default:
            adapterOf(tree)["arrays"][0]["disk_drives"].erase(0);
            adapterOf(tree)["arrays"][0]["disk_drives"].push_back(member(1, upTo(4), upTo(4)));
            break;
    }
}

// A change in words that are the same for a change and the change back.
std::string inOneWay(const Change& change, bool back) {
    const auto directions = back ? std::array{'n', 'b', 'w'} : std::array{'n', 'w', 'b'};
    const auto letter = [&](Direction direction) {
        return directions.at(static_cast<std::size_t>(direction));
    };
    std::string type = std::to_string(static_cast<int>(change.type));
    if (change.type == Type::added || change.type == Type::removed) {
        type = (change.type == Type::added) == back ? "goes" : "comes";
    }
    std::string text = type + letter(change.direction) + std::string{change.kind};
    std::set<std::string> details;
    for (const Detail& detail : change.details) {
        const auto& [from, to] =
            back ? std::tie(detail.after, detail.before) : std::tie(detail.before, detail.after);
        details.insert(detail.key + from.dump() + ">" + to.dump() + letter(detail.direction));
    }
    for (const std::string& detail : details) {
        text += " " + detail;
    }
    return text;
}

std::multiset<std::string> inOneWay(const std::vector<Change>& changes, bool back) {
    std::multiset<std::string> texts;
    for (const Change& change : changes) {
        texts.insert(inOneWay(change, back));
    }
    return texts;
}

TEST(TheWayBack, TellsTheOppositeOfEveryChange) {
    std::mt19937 random{2};
    for (int round = 0; round < 300; ++round) {
        const Json before = smallServer();
        Json after = before;
        for (int count = 0; count <= round % 6; ++count) {
            edit(after, random);
        }
        const auto there = changes(before, after, codes());
        const auto back = changes(after, before, codes());
        ASSERT_EQ(inOneWay(there, false), inOneWay(back, true)) << told(there) << told(back);
    }
}

}  // namespace
}  // namespace raidinfo::diff
