#include "json.h"

#include <gtest/gtest.h>

#include "sample.h"

namespace raidinfo {
namespace {

using test::sample;

TEST(InventoryJson, NamesEveryListAndEveryField) {
    Snapshot snapshot;
    snapshot.of(KindId::fan) = {
        sample(kindOf(KindId::fan), {{"fan_name", "Disk Drive 15"}, {"status", -2147483647 - 1}})};
    EXPECT_EQ(inventoryJson(snapshot), R"({
  "pellion_adapters": [],
  "lsi_adapters": [],
  "vantry_adapters": [],
  "channels": [],
  "arrays": [],
  "spanned_arrays": [],
  "logical_drives": [],
  "disk_drives": [],
  "enclosures": [],
  "fans": [
    {
      "position": 0,
      "fan_name": "Disk Drive 15",
      "status_name": "",
      "channel_name": "",
      "adapter_name": "",
      "status": -2147483648,
      "enclosure_id": 0,
      "channel_id": 0,
      "adapter_id": 0
    }
  ],
  "power_supplies": [],
  "temperature_sensors": []
}
)");
}

TEST(EventJson, IsOneLine) {
    const Record event =
        sample(eventKind(),
               {{"sequence_number", 57}, {"message_string", "\"a\"\n\tb\x01 é"}, {"device_id", 3}});
    EXPECT_EQ(eventJson(event),
              R"({"sequence_number":57,"date":"","type":"","message_string":"\"a\"\n\tb\u0001 é",)"
              R"("event_code":0,"adapter":0,"channel":0,"device_id":3,"enclosure_id":0,)"
              R"("logical_drive":0,"server_name":"","server_address":""})"
              "\n");
}

TEST(TreeJson, NestsTheListsAndWritesAReferenceShort) {
    const Kind& channels = kindOf(KindId::channel);
    const Record channel = sample(channels, {{"channel_id", 1}});
    Node member{.title = "not in JSON",
                .extras = {{"device_id", 3}, {"present", true}},
                .remark = "nor is this",
                .kind = &channels,
                .record = &channel,
                .position = 4,
                .inFull = false};
    Node full{.title = "",
              .extras = {{"family", UnknownStatus{}}, {"numbers", std::vector<int>{7, 8}}},
              .kind = &channels,
              .record = &channel,
              .position = 0,
              .groups = {{"members", {member}}, {"none", {}}}};
    EXPECT_EQ(treeJson({"roots", {full}}), R"({
  "roots": [
    {
      "position": 0,
      "family": null,
      "numbers": [
        7,
        8
      ],
      "channel_name": "",
      "adapter_name": "",
      "channel_id": 1,
      "adapter_id": 0,
      "type": 0,
      "transfer_speed": 0,
      "initiator_id": 0,
      "members": [
        {
          "position": 4,
          "device_id": 3,
          "present": true
        }
      ],
      "none": []
    }
  ]
}
)");
}

}  // namespace
}  // namespace raidinfo
