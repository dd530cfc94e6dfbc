#include "json/json.h"

#include <gtest/gtest.h>
#include <stdlib.h>

#include <nlohmann/json.hpp>

#include "json/envelope.h"
#include "sample.h"

namespace raidinfo {
namespace {

using test::sample;

TEST(RowsJson, HaveAMemberForEachColumn) {
    Snapshot snapshot;
    snapshot.of(KindId::fan) = {
        sample(kindOf(KindId::fan), {{"fan_name", "Disk Drive 15"}, {"status", -2147483647 - 1}})};
    const Json rows = rowsJson(listingOf(kindOf(KindId::fan), snapshot, {"adapters", {}}));
    EXPECT_EQ(
        rows.dump(),
        R"([{"position":0,"index":null,"enclosure":null,"channel":null,"adapter":null,"fan_name":"Disk Drive 15","status_name":"",)"
        R"("channel_name":"","adapter_name":"","status":-2147483648,"enclosure_id":0,)"
        R"("channel_id":0,"adapter_id":0}])");
}

TEST(EventJson, HasEveryField) {
    const Record event =
        sample(eventKind(),
               {{"sequence_number", 57}, {"message_string", "\"a\"\n\tb\x01 é"}, {"device_id", 3}});
    EXPECT_EQ(eventJson(event).dump(),
              R"({"sequence_number":57,"date":"","type":"","message_string":"\"a\"\n\tb\u0001 é",)"
              R"("event_code":0,"adapter":0,"channel":0,"device_id":3,"enclosure_id":0,)"
              R"("logical_drive":0,"server_name":"","server_address":""})");
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
              .extras = {{"family", Unknown{}}, {"numbers", std::vector<int>{7, 8}}},
              .kind = &channels,
              .record = &channel,
              .position = 0,
              .groups = {{"members", {member}}, {"none", {}}}};
    EXPECT_EQ(treeJson({"roots", {full}}).dump(),
              R"({"roots":[{"position":0,"family":null,"numbers":[7,8],"channel_name":"",)"
              R"("adapter_name":"","channel_id":1,"adapter_id":0,"type":0,"transfer_speed":0,)"
              R"("initiator_id":0,"members":[{"position":4,"device_id":3,"present":true}],)"
              R"("none":[]}]})");
}

TEST(Envelope, SaysWhatIsInItAndWhenItWasMade) {
    setenv("SOURCE_DATE_EPOCH", "1163000000", 1);
    EXPECT_EQ(document(enveloped({"service", "127.0.0.1:34572"}, {}, Json::array())), R"({
  "schema_version": "1.0",
  "generated_at": "2006-11-08T15:33:20Z",
  "source": {
    "type": "service",
    "name": "127.0.0.1:34572"
  },
  "complete": true,
  "errors": [],
  "data": []
}
)");
    unsetenv("SOURCE_DATE_EPOCH");
}

TEST(Envelope, IsIncompleteWithTroubleAndValidWhateverTheTroubleSays) {
    setenv("SOURCE_DATE_EPOCH", "0", 1);
    EXPECT_EQ(documentLine(enveloped({"none", ""}, {{"usage", "what is \xE9?"}}, nullptr)),
              R"({"schema_version":"1.0","generated_at":"1970-01-01T00:00:00Z",)"
              R"("source":{"type":"none","name":""},"complete":false,)"
              R"("errors":[{"code":"usage","message":"what is )"
              "\uFFFD"
              R"(?"}],"data":null})"
              "\n");
    unsetenv("SOURCE_DATE_EPOCH");
}

}  // namespace
}  // namespace raidinfo
