#include <gtest/gtest.h>

#include "diff/diff.h"
#include "trees.h"

namespace raidinfo::diff {
namespace {

using namespace test;

TEST(ToldChanges, ShowInTheMarginWhatGotWorse) {
    const Place place{{"adapter_id", "adapter", 1}, {"device_id", "device", 3}};
    const auto change = [&place](Direction direction) {
        return Change{.type = Type::added,
                      .direction = direction,
                      .kind = "disk_drive",
                      .noun = "drive",
                      .place = place,
                      .origin = {},
                      .former = {},
                      .details = {}};
    };
    EXPECT_EQ(
        told({change(Direction::worse), change(Direction::neutral), change(Direction::better)}),
        "worse   adapter 1, device 3: drive added\n"
        "        adapter 1, device 3: drive added\n"
        "better  adapter 1, device 3: drive added\n");
}

TEST(ToldChanges, SayThatThereAreNone) { EXPECT_EQ(told({}), "No changes\n"); }

TEST(ChangesData, HoldEveryDetailWithItsValues) {
    const Json before = smallServer();
    Json after = before;
    driveOf(after, 1, 3)["serial_number"] = "\x1b";
    driveOf(after, 1, 3)["overall_status"] = nullptr;
    EXPECT_EQ(changesData(changes(before, after, codes())).dump(2), R"({
  "changes": [
    {
      "change": "replaced",
      "direction": "worse",
      "kind": "disk_drive",
      "place": {
        "adapter_id": 1,
        "channel_id": 1,
        "device_id": 3
      },
      "text": "adapter 1, channel 1, device 3: drive replaced, serial QS0101003K → \\u{1b}, Normal → unknown",
      "details": [
        {
          "key": "serial_number",
          "title": "Serial number",
          "before": "QS0101003K",
          "after": "\u001b",
          "direction": "neutral",
          "text": "serial QS0101003K → \\u{1b}"
        },
        {
          "key": "overall_status",
          "title": "Overall status",
          "before": "Normal",
          "after": null,
          "direction": "worse",
          "text": "Normal → unknown"
        }
      ]
    }
  ]
})");
}

TEST(ChangesData, SayWhereARecordWasMovedFrom) {
    const Json before = smallServer();
    Json after = before;
    driveOf(after, 2, 1)["device_id"] = 7;
    const Json data = changesData(changes(before, after, codes()));
    ASSERT_EQ(data["changes"].size(), 1U);
    EXPECT_EQ(data["changes"][0]["change"], "moved");
    EXPECT_EQ(data["changes"][0]["place"],
              Json({{"adapter_id", 1}, {"channel_id", 2}, {"device_id", 7}}));
    EXPECT_EQ(data["changes"][0]["former_place"],
              Json({{"adapter_id", 1}, {"channel_id", 2}, {"device_id", 1}}));
}

TEST(ChangesData, GiveWhatThereIsToSayOfARecordThatWentAsItsValuesBefore) {
    const Json before = smallServer();
    Json after = before;
    adapterOf(after)["channels"][0]["enclosures"] = Json::array();
    const Json data = changesData(changes(before, after, codes()));
    ASSERT_EQ(data["changes"].size(), 1U);
    EXPECT_EQ(data["changes"][0]["change"], "removed");
    EXPECT_EQ(data["changes"][0]["details"].back(), Json::parse(R"({
        "key": "temperature_sensors", "title": "Temperature sensors", "before": 2, "after": null,
        "direction": "neutral", "text": "2 temperature sensors"})"));
}

TEST(ChangesData, AreAnEmptyListForNone) { EXPECT_EQ(changesData({}).dump(), R"({"changes":[]})"); }

}  // namespace
}  // namespace raidinfo::diff
