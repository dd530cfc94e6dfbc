#include "diff/matching.h"

#include <gtest/gtest.h>

#include <string>

#include "trees.h"

namespace raidinfo::diff {
namespace {

using namespace test;

constexpr int many = 10'000;

// Compares keys and counts how often.
struct CountingSame {
    std::size_t* count;

    bool operator()(const std::string& left, const std::string& right) const {
        ++*count;
        return left == right;
    }
};

template <typename Edit>
Json rack(const Edit& edit) {
    Json tree = smallServer();
    Json& drives = drivesOf(tree, 1);
    drives = Json::array();
    for (int device = 0; device < many; ++device) {
        Json record = drive(1, device, device, "QS" + std::to_string(device));
        edit(record, device);
        drives.push_back(std::move(record));
    }
    return tree;
}

Matching matchedDrives(Entries& before, Entries& after, std::size_t& comparisons) {
    for (const SubjectId around : {SubjectId::adapter, SubjectId::channel}) {
        static_cast<void>(matched(before.of(around), after.of(around)));
    }
    return matched(before.of(SubjectId::diskDrive), after.of(SubjectId::diskDrive),
                   CountingSame{&comparisons});
}

struct Result {
    Matching matching;
    std::size_t comparisons = 0;
};

// The trees outlive the entries that the matching points to no longer than this function.
Result matchedRacks(const Json& before, const Json& after) {
    Entries former{before};
    Entries present{after};
    Result result;
    result.matching = matchedDrives(former, present, result.comparisons);
    return result;
}

const auto asTheyAre = [](Json& /*drive*/, int /*device*/) {};

TEST(Matching, ComparesEachOfManyDrivesAFewTimes) {
    const auto renumber = [](Json& drive, int device) { drive["device_id"] = many - device; };
    const auto [matching, comparisons] = matchedRacks(rack(asTheyAre), rack(renumber));
    EXPECT_EQ(matching.both.size(), many + 2U);
    EXPECT_LE(comparisons, 4U * many);
}

TEST(Matching, ComparesEachOfManyDrivesWithoutASerialNumberAFewTimes) {
    const auto clear = [](Json& drive, int /*device*/) { drive["serial_number"] = ""; };
    const auto [matching, comparisons] = matchedRacks(rack(clear), rack(clear));
    EXPECT_EQ(matching.both.size(), many + 2U);
    EXPECT_LE(comparisons, 4U * many);
}

TEST(Matching, ComparesEachOfManyDrivesThatCannotBeToldApartAFewTimes) {
    const auto makeEqual = [](Json& drive, int /*device*/) {
        drive["serial_number"] = "0";
        drive["device_id"] = 0;
    };
    const auto [matching, comparisons] = matchedRacks(rack(makeEqual), rack(makeEqual));
    EXPECT_EQ(matching.both.size(), 2U);
    EXPECT_TRUE(matching.removed.empty() && matching.added.empty());
    EXPECT_LE(comparisons, 8U * many);
}

TEST(Matching, PairsEqualRecordsOfOneAddressFirst) {
    Json before = smallServer();
    for (const int size : {3, 1, 2}) {
        drivesOf(before, 1).push_back(drive(1, 9, 10 + size, ""));
        drivesOf(before, 1).back()["size"] = size;
    }
    Json after = before;
    taken(drivesOf(after, 1), "size", 1);
    const Result result = matchedRacks(before, after);
    EXPECT_EQ(result.matching.removed.size(), 1U);
    EXPECT_TRUE(result.matching.added.empty());
}

TEST(ManyDrives, AreComparedCompletely) {
    const auto fail = [](Json& drive, int device) {
        drive["overall_status"] = device % 2 == 0 ? "Normal" : "Critical";
    };
    EXPECT_EQ(changes(rack(asTheyAre), rack(fail), codes()).size(), many / 2U);
}

}  // namespace
}  // namespace raidinfo::diff
