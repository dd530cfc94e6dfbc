#include "health/policy.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>

#include "health/judge.h"
#include "health/vocabulary.h"
#include "listing/listing.h"
#include "machine.h"
#include "settings/document.h"
#include "support/files.h"

namespace raidinfo::health {
namespace {

using raid::test::writeFile;
using settings::parsedDocument;
using test::Machine;
using testing::ElementsAre;
using testing::IsEmpty;

Policy policyOf(const std::string& text) {
    return amendedPolicy(parsedDocument(text, "site.toml"), shippedCodeBook());
}

// "severity rule" of each finding of this policy.
std::vector<std::string> found(const Machine& machine, const std::string& policy) {
    std::vector<std::string> findings;
    for (const Finding& finding :
         judge(machine.trees(), policyOf(policy), shippedCodeBook()).findings) {
        findings.push_back(std::string{word(finding.severity)} + " " + finding.rule);
    }
    return findings;
}

std::string ruleOn(const std::string& kind, const std::string& when) {
    return "defaults = false\n[[rule]]\nname = \"mine\"\nkind = \"" + kind +
           "\"\nseverity = \"warning\"\nmessage = \"found\"\nwhen = " + when + "\n";
}

TEST(Policy, OfAnEmptyFileIsTheDefault) {
    const Policy policy = policyOf("");
    const Policy shipped = defaultPolicy(shippedCodeBook());
    EXPECT_EQ(policy.rules.size(), shipped.rules.size());
    EXPECT_EQ(policy.counts.size(), shipped.counts.size());
}

TEST(Policy, ChangesOnlyWhatItNamesOfADefaultRule) {
    Machine machine;
    machine.set(KindId::diskDrive, 0, "smart_error", true);
    EXPECT_THAT(found(machine, ""), ElementsAre("warning disk-drive-smart-error"));
    EXPECT_THAT(found(machine,
                      "[[rule]]\nname = \"disk-drive-smart-error\"\n"
                      "severity = \"critical\"\n"),
                ElementsAre("critical disk-drive-smart-error"));
}

TEST(Policy, DisablesADefaultRule) {
    Machine machine;
    machine.set(KindId::diskDrive, 0, "smart_error", true);
    EXPECT_THAT(found(machine, "[[rule]]\nname = \"disk-drive-smart-error\"\nenabled = false\n"),
                IsEmpty());
}

TEST(Policy, AddsRulesAfterTheDefaultOnes) {
    Machine machine;
    machine.set(KindId::diskDrive, 0, "smart_error", true);
    EXPECT_THAT(found(machine,
                      "[[rule]]\nname = \"small\"\nkind = \"disk_drives\"\n"
                      "when = { field = \"size\", below = 100 }\n"
                      "severity = \"warning\"\nmessage = \"has {size}\"\n"),
                ElementsAre("warning disk-drive-smart-error"));
    machine.set(KindId::diskDrive, 2, "size", 99);
    EXPECT_THAT(found(machine,
                      "[[rule]]\nname = \"small\"\nkind = \"disk_drives\"\n"
                      "when = { field = \"size\", below = 100 }\n"
                      "severity = \"warning\"\nmessage = \"has {size}\"\n"),
                ElementsAre("warning disk-drive-smart-error", "warning small"));
}

TEST(Policy, StandsAloneWhereItWantsNoDefaults) {
    const Policy policy = policyOf(ruleOn("fans", "{ field = \"status\", above = 0 }"));
    EXPECT_THAT(policy.counts, IsEmpty());
    ASSERT_EQ(policy.rules.size(), 1U);
    EXPECT_EQ(policy.rules[0].name, "mine");
}

TEST(Policy, ChangesACountAndSoTheRulesThatUseIt) {
    Machine machine;
    const std::string wider =
        "[[count]]\nname = \"ready_spares\"\nwhen = { field = \"state\", is = \"online\" }\n";
    machine.set(KindId::diskDrive, 3, "state", 0);
    EXPECT_THAT(found(machine, wider), IsEmpty());
    for (std::size_t drive = 0; drive < 3; ++drive) {
        machine.set(KindId::diskDrive, drive, "state", 0);
    }
    EXPECT_THAT(found(machine, wider), ElementsAre("warning hot-spare-missing"));
}

TEST(Policy, NamesWhatAListingShows) {
    for (const std::string& kind : ruleKinds()) {
        const auto fields = ruleFields(kind);
        for (const Kind* const listed : kindsWritten(kindOfCodes(kind))) {
            for (const ListColumn& column : columnsOf(*listed)) {
                if (column.key != "position") {
                    EXPECT_NE(std::ranges::find(fields, column.key, &RuleField::key), fields.end())
                        << kind << " " << column.key;
                }
            }
        }
    }
}

TEST(Policy, MayKeepToTheFansOfAnEnclosure) {
    Machine machine;
    const auto finds = [&machine](const std::string& place) {
        return found(machine,
                     ruleOn("fans", "[" + place + ", { field = \"index\", at_least = 0 }]"));
    };
    EXPECT_THAT(finds("{ field = \"enclosure\", is = 8 }"), ElementsAre("warning mine"));
    EXPECT_THAT(finds("{ field = \"enclosure\", is = 7 }"), IsEmpty());
    EXPECT_THAT(finds("{ field = \"channel\", is = 1 }"), ElementsAre("warning mine"));
    EXPECT_THAT(finds("{ field = \"channel\", is = 0 }"), IsEmpty());
    EXPECT_THAT(finds("{ field = \"adapter\", is = 1 }"), ElementsAre("warning mine"));
    EXPECT_THAT(finds("{ field = \"adapter\", is = 8 }"), IsEmpty());
}

TEST(Policy, IsReadFromAFile) {
    writeFile("site.toml", "[[rule]]\nname = \"fan-warning\"\nenabled = false\n");
    const Policy policy = readPolicy("site.toml", shippedCodeBook());
    const auto fan = std::ranges::find(policy.rules, "fan-warning", &Rule::name);
    ASSERT_NE(fan, policy.rules.end());
    EXPECT_FALSE(fan->enabled);
    EXPECT_EQ(settings::shown(fan->place), "site.toml:2");
}

TEST(Policy, FollowsTheCodeBookInWhatANameMeans) {
    CodeBook book = shippedCodeBook();
    book.define(
        "disk_drives", "state",
        CodeBook::Codes{
            {0, "failed"}, {7, "failed"}, {1, "ready"}, {2, "hot spare"}, {3, "rebuilding"}});
    Machine machine;
    machine.set(KindId::diskDrive, 0, "state", 7);
    const Verdict verdict = judge(machine.trees(), defaultPolicy(book), book);
    ASSERT_FALSE(verdict.findings.empty());
    EXPECT_EQ(verdict.findings[0].message, "the drive has failed, state 7 (failed)");
}

TEST(Policy, KnowsNothingOfAFieldWhoseCodesTheCodeBookTakesAway) {
    CodeBook book = shippedCodeBook();
    book.define("fans", "status", CodeBook::Codes{});
    const Verdict verdict = judge(Machine{}.trees(), defaultPolicy(book), book);
    ASSERT_EQ(verdict.findings.size(), 1U);
    EXPECT_EQ(verdict.findings[0].rule, "part-status-unknown");
    EXPECT_EQ(verdict.severity, Severity::unknown);
}

}  // namespace
}  // namespace raidinfo::health
