#include "health/health_json.h"

#include <gtest/gtest.h>

#include "health/judge.h"
#include "machine.h"
#include "settings/document.h"

namespace raidinfo::health {
namespace {

using nlohmann::ordered_json;
using test::Machine;

ordered_json dataOf(const Machine& machine, const std::string& policy = "") {
    const CodeBook book = shippedCodeBook();
    return healthData(judge(
        machine.trees(), amendedPolicy(settings::parsedDocument(policy, "site.toml"), book), book));
}

TEST(HealthJson, HasEveryFindingAndEveryCheck) {
    Machine machine;
    machine.set(KindId::diskDrive, 1, "state", 4);
    const ordered_json data = dataOf(machine, R"(defaults = false
[[rule]]
name = "drive"
kind = "disk_drives"
when = [{ field = "state", is = "failed" }, { field = "size", above = 0 }]
severity = "critical"
message = "state {state}"
)");
    EXPECT_EQ(data.dump(2), R"json({
  "verdict": "critical",
  "status": 2,
  "reason": null,
  "findings": [
    {
      "severity": "critical",
      "rule": "drive",
      "message": "state 4 (failed)",
      "record": {
        "kind": "disk_drives",
        "position": 1,
        "address": "adapter 1, channel 1, disk drive 1, serial QS1"
      },
      "field": "state",
      "value": 4,
      "code_name": "failed",
      "facts": [
        {
          "field": "state",
          "value": 4,
          "code_name": "failed"
        },
        {
          "field": "size",
          "value": 70006,
          "code_name": null
        }
      ]
    }
  ],
  "checked": [
    {
      "rule": "drive",
      "severity": "critical",
      "enabled": true,
      "kinds": [
        "disk_drives"
      ],
      "condition": "state is failed and size is above 0",
      "records": 4,
      "findings": 1,
      "place": "site.toml:3"
    }
  ],
  "records": {
    "adapters": 1,
    "channels": 1,
    "arrays": 1,
    "spanned_arrays": 0,
    "logical_drives": 1,
    "disk_drives": 4,
    "enclosures": 1,
    "fans": 1,
    "power_supplies": 1,
    "temperature_sensors": 1,
    "members": 3
  }
})json");
}

TEST(HealthJson, HasNullForWhatIsUnknownOrUnpublished) {
    Machine machine;
    machine.set(KindId::enclosure, 0, "overall_status", Unknown{});
    machine.setExtra(machine.member(0), "present", false);
    machine.member(0).position.reset();
    const ordered_json findings = dataOf(machine)["findings"];
    ASSERT_EQ(findings.size(), 2U);
    EXPECT_EQ(findings[0]["rule"], "array-member-missing");
    EXPECT_EQ(findings[0]["record"]["kind"], "members");
    EXPECT_TRUE(findings[0]["record"]["position"].is_null());
    EXPECT_EQ(findings[0]["value"], false);
    EXPECT_EQ(findings[1]["severity"], "unknown");
    EXPECT_TRUE(findings[1]["value"].is_null());
}

TEST(HealthJson, GivesTheReasonWhereNothingWasJudged) {
    EXPECT_EQ(healthData(unknownBecause("the service is silent")).dump(),
              R"({"verdict":"unknown","status":3,"reason":"the service is silent",)"
              R"("findings":[],"checked":[],"records":{}})");
}

TEST(HealthJson, IsUtf8WhateverFilesAreCalled) {
    const CodeBook book = shippedCodeBook();
    const auto policy = amendedPolicy(
        settings::parsedDocument("[[rule]]\nname = \"fan-critical\"\n", "\xFF.toml"), book);
    const ordered_json data = healthData(judge(Machine{}.trees(), policy, book));
    EXPECT_NE(data.dump().find("\uFFFD.toml:2"), std::string::npos);
    EXPECT_EQ(healthData(unknownBecause("no \xFF"))["reason"], "no \uFFFD");
}

}  // namespace
}  // namespace raidinfo::health
