#include "health/judge.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>

#include "machine.h"
#include "sample.h"
#include "settings/document.h"

namespace raidinfo::health {
namespace {

using test::Machine;
using testing::HasSubstr;

Verdict judged(const Group& trees, const std::string& policy = "") {
    const CodeBook book = shippedCodeBook();
    return judge(trees, amendedPolicy(settings::parsedDocument(policy, "site.toml"), book), book);
}

const Checked& checkOf(const Verdict& verdict, const std::string& rule) {
    return *std::ranges::find(verdict.checked, rule, &Checked::rule);
}

void warn(Machine& machine) { machine.set(KindId::fan, 0, "status", 1); }
void endanger(Machine& machine) { machine.set(KindId::powerSupply, 0, "status", 2); }
void puzzle(Machine& machine) { machine.set(KindId::temperatureSensor, 0, "status", 40); }

TEST(Verdict, IsTheGravestFinding) {
    Machine machine;
    EXPECT_EQ(exitStatus(judged(machine.trees())), 0);
    warn(machine);
    EXPECT_EQ(exitStatus(judged(machine.trees())), 1);
    endanger(machine);
    EXPECT_EQ(exitStatus(judged(machine.trees())), 2);
}

TEST(Verdict, IsUnknownRatherThanOkButHidesNothingKnown) {
    Machine machine;
    puzzle(machine);
    EXPECT_EQ(exitStatus(judged(machine.trees())), 3);
    warn(machine);
    EXPECT_EQ(exitStatus(judged(machine.trees())), 1);
    endanger(machine);
    EXPECT_EQ(exitStatus(judged(machine.trees())), 2);
}

TEST(Verdict, NamesTheGravestFindingsFirstAndThenTheFirstRules) {
    Machine machine;
    puzzle(machine);
    warn(machine);
    endanger(machine);
    machine.set(KindId::diskDrive, 0, "state", 4);
    std::vector<std::string> rules;
    for (const Finding& finding : judged(machine.trees()).findings) {
        rules.push_back(finding.rule);
    }
    EXPECT_THAT(rules, testing::ElementsAre("disk-drive-failed", "power-supply-critical",
                                            "fan-warning", "part-status-unknown"));
}

TEST(Verdict, OnNoAdapterIsUnknown) {
    const Verdict verdict = judged({"adapters", {}});
    EXPECT_EQ(verdict.severity, Severity::unknown);
    EXPECT_EQ(verdict.reason, "there is no RAID adapter");
}

TEST(Verdict, OfNoRulesIsUnknown) {
    const Verdict verdict = judged(Machine{}.trees(), "defaults = false");
    EXPECT_EQ(verdict.severity, Severity::unknown);
    EXPECT_THAT(verdict.reason, HasSubstr("no rule"));
}

TEST(Verdict, OfRulesForOtherKindsOnlyIsUnknown) {
    const Verdict verdict =
        judged(Machine{}.trees(),
               "defaults = false\n[[rule]]\nname = \"r\"\nkind = \"spanned_arrays\"\n"
               "severity = \"warning\"\nmessage = \"m\"\nwhen = { field = \"size\", is = 0 }");
    EXPECT_EQ(verdict.severity, Severity::unknown);
}

TEST(Verdict, BecauseOfAReasonIsUnknown) {
    const Verdict verdict = unknownBecause("the service is silent");
    EXPECT_EQ(exitStatus(verdict), 3);
    EXPECT_EQ(verdict.reason, "the service is silent");
}

TEST(Verdict, TellsHowManyRecordsEachRuleLookedAt) {
    Machine machine;
    machine.set(KindId::diskDrive, 0, "state", 4);
    const Verdict verdict = judged(machine.trees(),
                                   "[[rule]]\nname = \"fan-warning\"\n"
                                   "enabled = false\n");
    const Checked& drives = checkOf(verdict, "disk-drive-failed");
    EXPECT_EQ(drives.records, 4U);
    EXPECT_EQ(drives.findings, 1U);
    EXPECT_EQ(drives.condition, "state is failed");
    const Checked& overall = checkOf(verdict, "overall-status-critical");
    EXPECT_EQ(overall.records, 7U);
    EXPECT_EQ(overall.findings, 0U);
    EXPECT_EQ(overall.kinds, (std::vector<std::string>{"adapters", "logical_drives", "disk_drives",
                                                       "enclosures"}));
    const Checked& fans = checkOf(verdict, "fan-warning");
    EXPECT_FALSE(fans.enabled);
    EXPECT_EQ(fans.records, 0U);
}

TEST(Verdict, CitesTheRecordAndEveryFieldOfTheRule) {
    Machine machine;
    machine.set(KindId::logicalDrive, 0, "state", 1);
    const Verdict verdict = judged(machine.trees());
    ASSERT_EQ(verdict.findings.size(), 1U);
    const Finding& finding = verdict.findings[0];
    EXPECT_EQ(finding.record.kind, "logical_drives");
    EXPECT_EQ(finding.record.position, 0U);
    ASSERT_EQ(finding.facts.size(), 3U);
    EXPECT_EQ(finding.facts[0].field, "state");
    EXPECT_EQ(finding.facts[0].value, Value{1});
    EXPECT_EQ(finding.facts[0].codeName, "degraded");
    EXPECT_EQ(finding.facts[0].shown, "1 (degraded)");
    EXPECT_EQ(finding.facts[2].field, "ready_spares");
    EXPECT_EQ(finding.facts[2].value, Value{1});
    EXPECT_EQ(finding.facts[2].codeName, std::nullopt);
}

TEST(Verdict, LeavesTheOverallStatusOutWhereSomethingBelowExplainsIt) {
    Machine machine;
    machine.set(KindId::pellionAdapter, 0, "overall_status", std::string{"Critical"});
    machine.set(KindId::diskDrive, 0, "overall_status", std::string{"Critical"});
    machine.set(KindId::diskDrive, 0, "state", 4);
    const Verdict verdict = judged(machine.trees());
    ASSERT_EQ(verdict.findings.size(), 1U);
    EXPECT_EQ(verdict.findings[0].rule, "disk-drive-failed");
    EXPECT_EQ(checkOf(verdict, "overall-status-critical").findings, 0U);
}

TEST(Verdict, TellsTheOverallStatusWhereTheRestIsLessGraveOrElsewhere) {
    Machine machine;
    machine.set(KindId::enclosure, 0, "overall_status", std::string{"Critical"});
    machine.set(KindId::fan, 0, "status", 1);
    machine.set(KindId::diskDrive, 0, "state", 4);
    const Verdict verdict = judged(machine.trees());
    ASSERT_EQ(verdict.findings.size(), 3U);
    EXPECT_EQ(verdict.findings[1].rule, "overall-status-critical");
    EXPECT_EQ(verdict.findings[1].record.kind, "enclosures");
}

TEST(Verdict, TellsTheOverallStatusOfAllThatNothingElseExplains) {
    Machine machine;
    machine.set(KindId::pellionAdapter, 0, "overall_status", std::string{"Critical"});
    machine.set(KindId::diskDrive, 0, "overall_status", std::string{"Critical"});
    EXPECT_EQ(judged(machine.trees()).findings.size(), 2U);
}

TEST(Verdict, LooksAtTheAdaptersOfAllFamilies) {
    const Records records{
        test::sample(kindOf(KindId::lsiAdapter), {{"adapter_id", 2}, {"battery_status", 3}})};
    Machine machine;
    Group trees = machine.trees();
    trees.nodes.push_back({.title = "LSI adapter 2",
                           .extras = {{"family", std::string{"lsi"}}},
                           .kind = &kindOf(KindId::lsiAdapter),
                           .record = records.data(),
                           .position = 0});
    const Verdict verdict = judged(trees);
    EXPECT_EQ(checkOf(verdict, "battery-failed").records, 2U);
    ASSERT_FALSE(verdict.findings.empty());
    EXPECT_EQ(verdict.findings[0].record.kind, "lsi_adapters");
    EXPECT_EQ(verdict.findings[0].record.address, "adapter 2");
}

TEST(Verdict, JudgesALogicalDriveOnceThatTwoArraysList) {
    Machine machine;
    machine.set(KindId::logicalDrive, 0, "state", 3);
    auto& arrays = machine.adapter().groups.at(1).nodes;
    Node second = arrays[0];
    second.position = 1;
    arrays.push_back(second);
    EXPECT_EQ(judged(machine.trees()).findings.size(), 1U);
}

TEST(Verdict, CountsForALogicalDriveOutsideAnyArrayNoMembers) {
    Machine machine;
    machine.set(KindId::logicalDrive, 0, "state", 1);
    machine.set(KindId::diskDrive, 0, "state", 3);
    auto& groups = machine.adapter().groups;
    const Node logicalDrive = groups.at(1).nodes.at(0).groups.at(0).nodes.at(0);
    groups.at(1).nodes.clear();
    groups.at(3).nodes.push_back(logicalDrive);
    const Verdict verdict = judged(machine.trees());
    EXPECT_EQ(verdict.findings[0].record.address, "adapter 1, channel 1, disk drive 0, serial QS0");
    EXPECT_EQ(verdict.findings[1].rule, "logical-drive-degraded-with-spare");
    EXPECT_EQ(verdict.findings[1].record.address, "adapter 1, logical drive 0");
}

TEST(Verdict, CountsForALogicalDriveOfASpannedArrayTheMembersOfItsArrays) {
    Machine machine;
    machine.set(KindId::logicalDrive, 0, "state", 1);
    machine.set(KindId::diskDrive, 0, "state", 3);
    auto& groups = machine.adapter().groups;
    Node array = groups.at(1).nodes.at(0);
    Node spanned{.title = "Spanned array 5", .groups = {array.groups.at(0), {"arrays", {array}}}};
    spanned.groups.at(1).nodes.at(0).groups.at(0).nodes.clear();
    groups.at(1).nodes.clear();
    groups.at(2).nodes.push_back(spanned);
    const Verdict verdict = judged(machine.trees());
    EXPECT_EQ(verdict.findings[1].rule, "logical-drive-degraded-in-rebuild");
    EXPECT_EQ(verdict.findings[1].record.address, "adapter 1, spanned array 5, logical drive 0");
}

TEST(Verdict, KeepsTextsOfTheServiceOnOneLine) {
    Machine machine;
    machine.set(KindId::diskDrive, 0, "serial_number", std::string{"A\nB\x1b"});
    machine.set(KindId::diskDrive, 0, "state", 4);
    const Verdict verdict = judged(machine.trees(),
                                   "[[rule]]\nname = \"disk-drive-failed\"\n"
                                   "message = \"\"\"{{serial}}\n{serial_number}\"\"\"\n");
    EXPECT_EQ(verdict.findings[0].record.address,
              "adapter 1, channel 1, disk drive 0, serial A\\u{a}B\\u{1b}");
    EXPECT_EQ(verdict.findings[0].message, "{serial}\\u{a}A\\u{a}B\\u{1b}");
}

}  // namespace
}  // namespace raidinfo::health
