#include "health/nagios.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <set>

#include "health/judge.h"
#include "machine.h"
#include "plugin_line.h"

namespace raidinfo::health {
namespace {

using test::Machine;
using test::parsedPluginLine;
using test::PluginLine;
using test::PluginMeasurement;
using testing::EndsWith;
using testing::HasSubstr;
using testing::Not;

Verdict judged(const Machine& machine) {
    const CodeBook book = shippedCodeBook();
    return judge(machine.trees(), defaultPolicy(book), book);
}

PluginLine lineOf(const Machine& machine) { return parsedPluginLine(nagiosLine(judged(machine))); }

const PluginMeasurement& measurement(const PluginLine& line, const std::string& label) {
    return *std::ranges::find(line.data, label, &PluginMeasurement::label);
}

TEST(NagiosLine, OfAHealthyMachine) {
    EXPECT_EQ(nagiosLine(judged(Machine{})),
              "RAID OK - nothing is wrong with 12 records | 'critical findings'=0;;0;0 "
              "'warning findings'=0;0;;0 'unknown findings'=0;;;0 adapters=1;;;0 channels=1;;;0 "
              "arrays=1;;;0 'spanned arrays'=0;;;0 'logical drives'=1;;;0 'disk drives'=4;;;0 "
              "enclosures=1;;;0 fans=1;;;0 'power supplies'=1;;;0 'temperature sensors'=1;;;0 "
              "members=3;;;0\n");
}

TEST(NagiosLine, NamesTheGravestFindingsOnly) {
    Machine machine;
    for (std::size_t drive = 0; drive < 4; ++drive) {
        machine.set(KindId::diskDrive, drive, "state", 4);
    }
    machine.set(KindId::fan, 0, "status", 1);
    const PluginLine line = lineOf(machine);
    EXPECT_EQ(line.service, "RAID");
    EXPECT_EQ(line.state, "CRITICAL");
    EXPECT_EQ(line.text,
              "6 findings in 12 records; critical: adapter 1, channel 1, disk drive 0, serial QS0: "
              "the drive has failed, state 4 (failed); critical: adapter 1, channel 1, disk drive "
              "1, serial QS1: the drive has failed, state 4 (failed); critical: adapter 1, channel "
              "1, disk drive 2, serial QS2: the drive has failed, state 4 (failed)");
    EXPECT_EQ(measurement(line, "critical findings").value, 4);
    EXPECT_EQ(measurement(line, "warning findings").value, 2);
}

TEST(NagiosLine, HasThresholdsThatAlertWhereTheVerdictDoes) {
    Machine machine;
    for (const int status : {0, 1, 2}) {
        machine.set(KindId::fan, 0, "status", status);
        const PluginLine line = lineOf(machine);
        const PluginMeasurement& critical = measurement(line, "critical findings");
        const PluginMeasurement& warning = measurement(line, "warning findings");
        EXPECT_EQ(test::alerts(critical.critical, critical.value), line.state == "CRITICAL");
        EXPECT_EQ(test::alerts(warning.warning, warning.value), line.state == "WARNING");
    }
}

TEST(NagiosLine, HasAWordForEachStatus) {
    Machine machine;
    EXPECT_EQ(lineOf(machine).state, "OK");
    machine.set(KindId::fan, 0, "status", 9);
    EXPECT_EQ(lineOf(machine).state, "UNKNOWN");
    machine.set(KindId::fan, 0, "status", 1);
    EXPECT_EQ(lineOf(machine).state, "WARNING");
    machine.set(KindId::fan, 0, "status", 2);
    EXPECT_EQ(lineOf(machine).state, "CRITICAL");
}

TEST(NagiosLine, OfNothingReadGivesTheReasonAndNoFigures) {
    EXPECT_EQ(nagiosLine(unknownBecause("no | service\n")), "RAID UNKNOWN - no / service\\u{a}\n");
}

TEST(NagiosLine, LetsNoTextOfTheServiceIntoItsGrammar) {
    Machine machine;
    machine.set(KindId::diskDrive, 0, "serial_number",
                std::string{"A|b=1\nRAID OK - fine\r\x1b[2J'é"});
    machine.set(KindId::diskDrive, 0, "state", 4);
    const PluginLine line = lineOf(machine);
    EXPECT_EQ(line.state, "CRITICAL");
    EXPECT_THAT(line.text, HasSubstr("serial A/b=1\\u{a}RAID OK - fine\\u{d}\\u{1b}[2J'é: "));
}

TEST(NagiosLine, CutsATextThatIsTooLongBetweenCharacters) {
    for (const std::size_t length : {900U, 901U, 100'000U}) {
        Machine machine;
        std::string serial(length, 'x');
        for (std::size_t index = 0; index < length; ++index) {
            serial += "é";
        }
        machine.set(KindId::diskDrive, 0, "serial_number", serial);
        machine.set(KindId::diskDrive, 0, "state", 4);
        const PluginLine line = lineOf(machine);
        EXPECT_LE(line.text.size(), 1000U);
        EXPECT_GE(line.text.size(), 998U);
        EXPECT_THAT(line.text, EndsWith("..."));
        EXPECT_THAT(line.text, Not(HasSubstr("\xC3.")));
        EXPECT_EQ(measurement(line, "disk drives").value, 4);
    }
}

TEST(NagiosLine, HasLabelsThatDifferWhereOldStoresCutThem) {
    constexpr std::size_t storedLength = 19;
    std::set<std::string> labels;
    const PluginLine line = lineOf(Machine{});
    for (const PluginMeasurement& measured : line.data) {
        labels.insert(measured.label.substr(0, storedLength));
    }
    EXPECT_EQ(labels.size(), line.data.size());
}

TEST(PerformanceData, QuotesALabelWhereItMust) {
    EXPECT_EQ(performanceData({"fans", 3}), "fans=3;;;0");
    EXPECT_EQ(performanceData({"disk drives", 3}), "'disk drives'=3;;;0");
    EXPECT_EQ(performanceData({"it's=a|b", 3, 1, 2}), "itsab=3;1;2;0");
    EXPECT_EQ(performanceData({"it's a=b", 3}), "'its ab'=3;;;0");
}

}  // namespace
}  // namespace raidinfo::health
