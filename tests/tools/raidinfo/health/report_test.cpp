#include "health/report.h"

#include <gtest/gtest.h>

#include "health/judge.h"
#include "machine.h"
#include "settings/document.h"

namespace raidinfo::health {
namespace {

using test::Machine;

// Two rules are enough to see the layout.
constexpr auto policy = R"(defaults = false

[[rule]]
name = "drive"
kind = "disk_drives"
when = [{ field = "state", in = ["failed", "rebuilding"] }, { field = "size", above = 0 }]
severity = "critical"
message = "state {state}, size {size}"

[[rule]]
name = "fan"
kind = ["fans", "power_supplies"]
when = { field = "status", known = false }
severity = "unknown"
message = "status {status}"

[[rule]]
name = "off"
kind = "fans"
when = { field = "status", is = 0 }
severity = "warning"
message = "m"
enabled = false
)";

Verdict judged(const Machine& machine) {
    const CodeBook book = shippedCodeBook();
    return judge(machine.trees(),
                 amendedPolicy(settings::parsedDocument(policy, "site.toml"), book), book);
}

Machine& spoilt(Machine& machine) {
    machine.set(KindId::diskDrive, 1, "state", 4);
    machine.set(KindId::powerSupply, 0, "status", 9);
    return machine;
}

TEST(Summary, OfAHealthyMachineIsOneLine) {
    EXPECT_EQ(summary(judged(Machine{})), "OK: nothing is wrong with 12 records\n");
}

TEST(Summary, HasALineForEachFinding) {
    Machine machine;
    EXPECT_EQ(
        summary(judged(spoilt(machine))),
        "CRITICAL: 2 findings in 12 records\n"
        "  critical  adapter 1, channel 1, disk drive 1, serial QS1: state 4 (failed), "
        "size 70006 MB\n"
        "  unknown   adapter 1, channel 1, enclosure 8, power supply 0: status 9 (unknown)\n");
}

TEST(Summary, TellsWhyNothingIsKnown) {
    EXPECT_EQ(summary(unknownBecause("the service is\nsilent")),
              "UNKNOWN: the service is\\u{a}silent\n");
}

TEST(Explanation, CitesRuleRecordFieldsAndEverythingChecked) {
    Machine machine;
    EXPECT_EQ(
        explained(judged(spoilt(machine))),
        "CRITICAL: 2 findings in 12 records\n"
        "  critical  adapter 1, channel 1, disk drive 1, serial QS1: state 4 (failed), "
        "size 70006 MB\n"
        "    record: disk_drives 1\n"
        "    fields: state = 4 (failed), size = 70006 MB\n"
        "    rule: drive, critical when state is one of failed, rebuilding and size is above 0 "
        "(site.toml:4)\n"
        "  unknown   adapter 1, channel 1, enclosure 8, power supply 0: status 9 (unknown)\n"
        "    record: power_supplies 0\n"
        "    fields: status = 9 (unknown)\n"
        "    rule: fan, unknown when status is not known (site.toml:11)\n"
        "Rules checked: 3\n"
        "  rule   severity  records  findings  condition\n"
        "  drive  critical  4        1         disk_drives: state is one of failed, rebuilding "
        "and size is above 0\n"
        "  fan    unknown   2        1         fans, power_supplies: status is not known\n"
        "  off    warning   -        -         disabled\n");
}

TEST(Explanation, ExplainsThatAllIsWell) {
    EXPECT_EQ(explained(judged(Machine{})),
              "OK: nothing is wrong with 12 records\n"
              "Rules checked: 3\n"
              "  rule   severity  records  findings  condition\n"
              "  drive  critical  4        0         disk_drives: state is one of failed, "
              "rebuilding and size is above 0\n"
              "  fan    unknown   2        0         fans, power_supplies: status is not known\n"
              "  off    warning   -        -         disabled\n");
}

TEST(Explanation, OfNothingReadSaysThatNothingWasChecked) {
    EXPECT_EQ(explained(unknownBecause("the service is silent")),
              "UNKNOWN: the service is silent\nRules checked: 0\n");
}

}  // namespace
}  // namespace raidinfo::health
