#include "health/condition.h"

#include <gtest/gtest.h>

#include "health/judge.h"
#include "machine.h"
#include "settings/document.h"

namespace raidinfo::health {
namespace {

using test::Machine;

// Whether a rule with this condition finds anything.
bool finds(const Machine& machine, const std::string& kind, const std::string& when) {
    const std::string text = "defaults = false\n[[rule]]\nname = \"mine\"\nkind = \"" + kind +
                             "\"\nseverity = \"warning\"\nmessage = \"found\"\nwhen = " + when;
    const CodeBook book = shippedCodeBook();
    const Policy policy = amendedPolicy(settings::parsedDocument(text, "site.toml"), book);
    return !judge(machine.trees(), policy, book).findings.empty();
}

TEST(Condition, ComparesNumbers) {
    Machine machine;
    machine.set(KindId::enclosure, 0, "logical_id", 5);
    for (const auto& [comparison, expected] :
         std::vector<std::pair<std::string, bool>>{{"is = 5", true},
                                                   {"is = 4", false},
                                                   {"not = 5", false},
                                                   {"not = 4", true},
                                                   {"in = [4, 5]", true},
                                                   {"in = [4, 6]", false},
                                                   {"not_in = [4, 5]", false},
                                                   {"not_in = [4, 6]", true},
                                                   {"below = 5", false},
                                                   {"below = 6", true},
                                                   {"above = 5", false},
                                                   {"above = 4", true},
                                                   {"at_most = 4", false},
                                                   {"at_most = 5", true},
                                                   {"at_least = 6", false},
                                                   {"at_least = 5", true}}) {
        EXPECT_EQ(finds(machine, "enclosures", "{ field = \"logical_id\", " + comparison + " }"),
                  expected)
            << comparison;
    }
}

TEST(Condition, ComparesTextsAndFlags) {
    Machine machine;
    EXPECT_TRUE(finds(machine, "adapters", R"({ field = "serial_number", is = "AD001417" })"));
    EXPECT_FALSE(finds(machine, "adapters", R"({ field = "serial_number", not = "AD001417" })"));
    EXPECT_TRUE(finds(machine, "members", R"({ field = "present", is = true })"));
    EXPECT_FALSE(finds(machine, "members", R"({ field = "present", is = false })"));
    EXPECT_TRUE(finds(machine, "adapters", R"({ field = "family", not_in = ["lsi", "vantry"] })"));
}

TEST(Condition, OnAnUnknownCodeHoldsForNumbersAndForNoName) {
    Machine machine;
    machine.set(KindId::fan, 0, "status", 9);
    EXPECT_TRUE(finds(machine, "fans", R"({ field = "status", is = 9 })"));
    EXPECT_TRUE(finds(machine, "fans", R"({ field = "status", not = 0 })"));
    EXPECT_FALSE(finds(machine, "fans", R"({ field = "status", is = "normal" })"));
    EXPECT_FALSE(finds(machine, "fans", R"({ field = "status", not = "normal" })"));
    EXPECT_FALSE(finds(machine, "fans", R"({ field = "status", not_in = ["normal"] })"));
    EXPECT_TRUE(finds(machine, "fans", R"({ field = "status", known = false })"));
    EXPECT_FALSE(finds(machine, "fans", R"({ field = "status", known = true })"));
    machine.set(KindId::fan, 0, "status", 1);
    EXPECT_TRUE(finds(machine, "fans", R"({ field = "status", not = "normal" })"));
    EXPECT_FALSE(finds(machine, "fans", R"({ field = "status", known = false })"));
}

TEST(Condition, OnAnUnknownHoldsForNoWord) {
    Machine machine;
    machine.set(KindId::enclosure, 0, "overall_status", Unknown{});
    EXPECT_FALSE(finds(machine, "enclosures", R"({ field = "overall_status", is = "Normal" })"));
    EXPECT_FALSE(finds(machine, "enclosures", R"({ field = "overall_status", not = "Normal" })"));
    EXPECT_TRUE(finds(machine, "enclosures", R"({ field = "overall_status", known = false })"));
}

TEST(Condition, OnAnUnknownNumberHoldsForNoBound) {
    Machine machine;
    machine.set(KindId::enclosure, 0, "logical_id", Unknown{});
    for (const std::string bound : {"below = 5", "above = 5", "at_most = 5", "at_least = 5"}) {
        EXPECT_FALSE(finds(machine, "enclosures", "{ field = \"logical_id\", " + bound + " }"));
    }
}

TEST(Condition, OnAFieldThatTheRecordLacksDoesNotHold) {
    Machine machine;
    machine.member(0).position.reset();
    machine.member(1).position.reset();
    machine.member(2).position.reset();
    EXPECT_FALSE(finds(machine, "members", R"({ field = "state", not = 4 })"));
    EXPECT_FALSE(finds(machine, "members", R"({ field = "state", known = false })"));
}

TEST(Condition, OnAMemberOfAnArraySeesItsDrive) {
    Machine machine;
    machine.set(KindId::diskDrive, 2, "state", 4);
    EXPECT_TRUE(finds(machine, "members", R"({ field = "state", is = "failed" })"));
    EXPECT_TRUE(finds(machine, "members", R"({ field = "serial_number", is = "QS2" })"));
}

}  // namespace
}  // namespace raidinfo::health
