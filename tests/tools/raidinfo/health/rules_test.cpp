#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <limits>
#include <set>

#include "codebook/code_book.h"
#include "health/judge.h"
#include "machine.h"
#include "support/row.h"

namespace raidinfo::health {
namespace {

using test::all;
using test::Change;
using test::Machine;
using test::setting;
using testing::IsEmpty;

constexpr int degraded = 1;
constexpr int rebuildingDrive = 3;

Verdict judged(const Machine& machine) {
    const CodeBook book = shippedCodeBook();
    return judge(machine.trees(), defaultPolicy(book), book);
}

// The findings of one rule.
std::vector<Finding> findingsOf(const Verdict& verdict, const std::string& rule) {
    std::vector<Finding> findings;
    for (const Finding& finding : verdict.findings) {
        if (finding.rule == rule) {
            findings.push_back(finding);
        }
    }
    return findings;
}

void noHotSpare(Machine& machine) { machine.setExtra(machine.drive(3), "hot_spare", false); }

const Change degradedDrive = setting(KindId::logicalDrive, 0, "state", degraded);
const Change rebuildingMember = setting(KindId::diskDrive, 1, "state", rebuildingDrive);

// A default rule: what makes it speak, about which record and how, and a change next to that one
// which is none of its business.
struct RuleCase : raid::test::Row {
    RuleCase(const char* rule, Severity spoken, const char* where, const char* what,
             Change spoiling, Change near)
        : Row{rule},
          severity{spoken},
          address{where},
          message{what},
          spoil{std::move(spoiling)},
          spare{std::move(near)} {}

    Severity severity;
    std::string address;
    std::string message;
    Change spoil;
    Change spare;
};

const std::vector<RuleCase> cases{
    {"disk-drive-failed", Severity::critical, "adapter 1, channel 1, disk drive 1, serial QS1",
     "the drive has failed, state 4 (failed)", setting(KindId::diskDrive, 1, "state", 4),
     setting(KindId::diskDrive, 1, "state", 5)},
    {"array-member-missing", Severity::critical,
     "adapter 1, array 0, member disk drive 1 of channel 1", "the drive is missing from its array",
     [](Machine& machine) {
         machine.setExtra(machine.member(1), "present", false);
         machine.member(1).position.reset();
     },
     setting(KindId::diskDrive, 1, "state", 4)},
    {"disk-drive-smart-error", Severity::warning, "adapter 1, channel 1, disk drive 1, serial QS1",
     "the drive expects to fail (SMART error)", setting(KindId::diskDrive, 1, "smart_error", true),
     setting(KindId::diskDrive, 1, "has_os_partition", true)},
    {"disk-drive-rebuilding", Severity::warning, "adapter 1, channel 1, disk drive 1, serial QS1",
     "the drive is being rebuilt, state 3 (rebuilding)", rebuildingMember,
     setting(KindId::logicalDrive, 0, "state", 2)},
    {"logical-drive-offline", Severity::critical, "adapter 1, array 0, logical drive 0",
     "the logical drive is offline, state 3 (offline)",
     setting(KindId::logicalDrive, 0, "state", 3), setting(KindId::logicalDrive, 0, "state", 4)},
    {"logical-drive-blocked", Severity::critical, "adapter 1, array 0, logical drive 0",
     "the logical drive is blocked", setting(KindId::logicalDrive, 0, "blocked", true),
     setting(KindId::logicalDrive, 0, "shared", true)},
    {"logical-drive-degraded", Severity::critical, "adapter 1, array 0, logical drive 0",
     "degraded, no drive is being rebuilt and no hot spare is ready, state 1 (degraded)",
     all({degradedDrive, noHotSpare}), degradedDrive},
    {"logical-drive-degraded-with-spare", Severity::warning, "adapter 1, array 0, logical drive 0",
     "degraded, hot spares ready: 1, state 1 (degraded)", degradedDrive,
     all({degradedDrive, setting(KindId::diskDrive, 3, "state", 4)})},
    {"logical-drive-degraded-in-rebuild", Severity::warning, "adapter 1, array 0, logical drive 0",
     "degraded, drives being rebuilt: 1, state 1 (degraded)",
     all({degradedDrive, rebuildingMember, noHotSpare}),
     // Another drive's rebuild does not mend this one.
     all({degradedDrive, setting(KindId::diskDrive, 3, "state", rebuildingDrive)})},
    {"logical-drive-rebuilding", Severity::warning, "adapter 1, array 0, logical drive 0",
     "being rebuilt, state 2 (rebuilding)", setting(KindId::logicalDrive, 0, "state", 2),
     degradedDrive},
    {"battery-failed", Severity::critical, "adapter 1, serial AD001417",
     "the battery has failed, battery status 3 (failed)",
     setting(KindId::pellionAdapter, 0, "battery_status", 3),
     setting(KindId::pellionAdapter, 0, "battery_status", 0)},
    {"battery-charging", Severity::warning, "adapter 1, serial AD001417",
     "the battery is charging, battery status 2 (charging)",
     setting(KindId::pellionAdapter, 0, "battery_status", 2),
     setting(KindId::pellionAdapter, 0, "battery_status", 3)},
    {"write-cache-unprotected", Severity::warning, "adapter 1, serial AD001417",
     "no battery keeps the write-back cache of logical drives: 1",
     setting(KindId::pellionAdapter, 0, "battery_status", 0),
     all({setting(KindId::pellionAdapter, 0, "battery_status", 0),
          setting(KindId::logicalDrive, 0, "write_cache_mode", 0)})},
    {"hot-spare-missing", Severity::warning, "adapter 1, serial AD001417",
     "no hot spare is ready for redundant logical drives: 1", noHotSpare,
     all({noHotSpare, setting(KindId::logicalDrive, 0, "raid_level", 0)})},
    {"fan-critical", Severity::critical, "adapter 1, channel 1, enclosure 8, fan 0",
     "the fan is critical, status 2 (critical)", setting(KindId::fan, 0, "status", 2),
     setting(KindId::fan, 0, "status", 1)},
    {"fan-warning", Severity::warning, "adapter 1, channel 1, enclosure 8, fan 0",
     "the fan warns, status 1 (warning)", setting(KindId::fan, 0, "status", 1),
     setting(KindId::fan, 0, "status", 2)},
    {"power-supply-critical", Severity::critical,
     "adapter 1, channel 1, enclosure 8, power supply 0",
     "the power supply is critical, status 2 (critical)",
     setting(KindId::powerSupply, 0, "status", 2), setting(KindId::fan, 0, "status", 2)},
    {"power-supply-warning", Severity::warning, "adapter 1, channel 1, enclosure 8, power supply 0",
     "the power supply warns, status 1 (warning)", setting(KindId::powerSupply, 0, "status", 1),
     setting(KindId::temperatureSensor, 0, "status", 1)},
    {"temperature-critical", Severity::critical,
     "adapter 1, channel 1, enclosure 8, temperature sensor 0",
     "the temperature is critical, status 2 (critical)",
     setting(KindId::temperatureSensor, 0, "status", 2),
     setting(KindId::powerSupply, 0, "status", 2)},
    {"temperature-warning", Severity::warning,
     "adapter 1, channel 1, enclosure 8, temperature sensor 0",
     "the temperature is at the warning limit, status 1 (warning)",
     setting(KindId::temperatureSensor, 0, "status", 1),
     setting(KindId::temperatureSensor, 0, "status", 2)},
    {"enclosure-absent", Severity::warning, "adapter 1, channel 1, enclosure 8",
     "the enclosure is absent, state 0 (absent)", setting(KindId::enclosure, 0, "state", 0),
     setting(KindId::enclosure, 0, "state", 2)},
    {"overall-status-critical", Severity::critical, "adapter 1, array 0, logical drive 0",
     "overall status Critical",
     setting(KindId::logicalDrive, 0, "overall_status", std::string{"Critical"}),
     setting(KindId::logicalDrive, 0, "overall_status", std::string{"Warning"})},
    {"overall-status-warning", Severity::warning, "adapter 1, channel 1, enclosure 8",
     "overall status Warning",
     setting(KindId::enclosure, 0, "overall_status", std::string{"Warning"}),
     setting(KindId::enclosure, 0, "overall_status", std::string{"Critical"})},
    {"overall-status-unknown", Severity::unknown, "adapter 1, serial AD001417",
     "overall status unknown", setting(KindId::pellionAdapter, 0, "overall_status", Unknown{}),
     setting(KindId::pellionAdapter, 0, "overall_status", std::string{"Critical"})},
    {"state-unknown", Severity::unknown, "adapter 1, channel 1, disk drive 1, serial QS1",
     "state 5 (unknown)", setting(KindId::diskDrive, 1, "state", 5),
     setting(KindId::diskDrive, 1, "state", 4)},
    {"raid-level-unknown", Severity::unknown, "adapter 1, array 0, logical drive 0",
     "RAID level 77 (unknown)", setting(KindId::logicalDrive, 0, "raid_level", 77),
     setting(KindId::logicalDrive, 0, "raid_level", 0)},
    {"write-cache-mode-unknown", Severity::unknown, "adapter 1, array 0, logical drive 0",
     "write cache mode 99 (unknown)", setting(KindId::logicalDrive, 0, "write_cache_mode", 99),
     setting(KindId::logicalDrive, 0, "write_cache_mode", 0)},
    {"part-status-unknown", Severity::unknown,
     "adapter 1, channel 1, enclosure 8, temperature sensor 0", "status -1 (unknown)",
     setting(KindId::temperatureSensor, 0, "status", -1),
     setting(KindId::temperatureSensor, 0, "status", 2)},
    {"battery-status-unknown", Severity::unknown, "adapter 1, serial AD001417",
     "battery status 4 (unknown)", setting(KindId::pellionAdapter, 0, "battery_status", 4),
     setting(KindId::pellionAdapter, 0, "battery_status", 3)},
    {"adapter-family-unknown", Severity::unknown, "adapter 1",
     "nothing is published of adapters of type o:Other",
     [](Machine& machine) {
         machine.adapter().record = nullptr;
         machine.adapter().kind = nullptr;
         machine.adapter().position.reset();
         machine.adapter().extras = {
             {"family", Unknown{}}, {"adapter_type", std::string{"o:Other"}}, {"adapter_id", 1}};
     },
     setting(KindId::pellionAdapter, 0, "overall_status", Unknown{})},
};

class DefaultRule : public testing::TestWithParam<RuleCase> {};

TEST_P(DefaultRule, SpeaksOfWhatItIsAbout) {
    Machine machine;
    GetParam().spoil(machine);
    const auto findings = findingsOf(judged(machine), GetParam().name);
    ASSERT_EQ(findings.size(), 1U);
    EXPECT_EQ(findings[0].severity, GetParam().severity);
    EXPECT_EQ(findings[0].record.address, GetParam().address);
    EXPECT_EQ(findings[0].message, GetParam().message);
}

TEST_P(DefaultRule, IsSilentAboutWhatIsOnlyNear) {
    Machine machine;
    GetParam().spare(machine);
    EXPECT_THAT(findingsOf(judged(machine), GetParam().name), IsEmpty());
}

std::string nameOfCase(const testing::TestParamInfo<RuleCase>& info) {
    std::string name = info.param.name;
    std::ranges::replace(name, '-', '_');
    return name;
}

INSTANTIATE_TEST_SUITE_P(Each, DefaultRule, testing::ValuesIn(cases), nameOfCase);

TEST(DefaultRules, AreAllTested) {
    std::set<std::string> tested;
    for (const RuleCase& row : cases) {
        tested.insert(row.name);
    }
    std::set<std::string> shipped;
    for (const Rule& rule : defaultPolicy(shippedCodeBook()).rules) {
        shipped.insert(rule.name);
    }
    EXPECT_EQ(tested, shipped);
}

TEST(DefaultRules, FindNothingWrongWithAHealthyMachine) {
    const Verdict verdict = judged(Machine{});
    EXPECT_EQ(verdict.severity, Severity::ok);
    EXPECT_THAT(verdict.findings, IsEmpty());
}

// Which level has no redundancy is for the code book to say.
TEST(DefaultRules, AskForAHotSpareByTheNameOfTheRaidLevel) {
    CodeBook book = shippedCodeBook();
    book.define("logical_drives", "raid_level", CodeBook::Codes{{5, "RAID 0"}, {0, "RAID 5"}});
    for (const auto& [level, missing] : {std::pair{5, 0U}, std::pair{0, 1U}}) {
        Machine machine;
        noHotSpare(machine);
        machine.set(KindId::logicalDrive, 0, "raid_level", level);
        const Verdict verdict = judge(machine.trees(), defaultPolicy(book), book);
        EXPECT_EQ(findingsOf(verdict, "hot-spare-missing").size(), missing) << level;
    }
}

// Whatever a rule looks at must not pass for well when it is not understood.
TEST(DefaultRules, CallNothingOkWhoseCodesAreUnknown) {
    const std::vector<std::pair<KindId, std::string_view>> codes{
        {KindId::pellionAdapter, "battery_status"},
        {KindId::logicalDrive, "state"},
        {KindId::logicalDrive, "raid_level"},
        {KindId::logicalDrive, "write_cache_mode"},
        {KindId::diskDrive, "state"},
        {KindId::enclosure, "state"},
        {KindId::fan, "status"},
        {KindId::powerSupply, "status"},
        {KindId::temperatureSensor, "status"}};
    for (const auto& [kind, field] : codes) {
        for (const int code : {-1, 99, std::numeric_limits<int>::max()}) {
            Machine machine;
            machine.set(kind, 0, field, code);
            EXPECT_EQ(judged(machine).severity, Severity::unknown) << kindOf(kind).key;
        }
    }
    for (const KindId kind :
         {KindId::pellionAdapter, KindId::logicalDrive, KindId::diskDrive, KindId::enclosure}) {
        Machine machine;
        machine.set(kind, 0, "overall_status", Unknown{});
        EXPECT_EQ(judged(machine).severity, Severity::unknown) << kindOf(kind).key;
    }
}

}  // namespace
}  // namespace raidinfo::health
