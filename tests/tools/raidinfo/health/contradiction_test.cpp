#include "health/contradiction.h"

#include <gtest/gtest.h>

#include <array>

#include "exit_status.h"
#include "health/policy.h"
#include "settings/document.h"

namespace raidinfo::health {
namespace {

/// What is said of a default rule with other conditions; empty where they are taken.
std::string complaintAbout(const std::string& rule, const std::string& conditions,
                           const CodeBook& book = shippedCodeBook()) {
    try {
        static_cast<void>(amendedPolicy(
            settings::parsedDocument(
                "[[rule]]\nname = \"" + rule + "\"\nwhen = [" + conditions + "]", "site.toml"),
            book));
    } catch (const Failure& failure) {
        return failure.what();
    }
    return "";
}

TEST(Contradiction, IsFoundWhereNoCountIsLeft) {
    EXPECT_EQ(complaintAbout("hot-spare-missing", R"({ field = "ready_spares", below = 1 },
                                                     { field = "ready_spares", not = 0 })"),
              "site.toml:3: the conditions exclude each other: ready_spares is below 1 and "
              "ready_spares is not 0");
    EXPECT_EQ(complaintAbout("hot-spare-missing", R"({ field = "ready_spares", below = 2 },
                                                     { field = "ready_spares", not = 0 })"),
              "");
    EXPECT_EQ(complaintAbout("hot-spare-missing", R"({ field = "ready_spares", at_most = 0 },
                                                     { field = "ready_spares", not = 1 })"),
              "");
}

TEST(Contradiction, IsFoundWhereNoWordIsLeft) {
    constexpr const char* rule = "overall-status-critical";
    EXPECT_EQ(complaintAbout(rule, R"({ field = "overall_status", not = "Normal" },
                           { field = "overall_status", not_in = ["Warning", "Critical"] })"),
              "site.toml:3: the conditions exclude each other: overall_status is not Normal and "
              "overall_status is none of Warning, Critical");
    EXPECT_EQ(complaintAbout(rule, R"({ field = "overall_status", not = "Normal" },
                                      { field = "overall_status", not = "Warning" })"),
              "");
    EXPECT_EQ(complaintAbout(rule, R"({ field = "overall_status", known = false },
                                      { field = "overall_status", known = false })"),
              "");
}

TEST(Contradiction, IsFoundWhereAWordIsToBeUnknown) {
    EXPECT_EQ(
        complaintAbout("adapter-family-unknown",
                       R"({ field = "family", is = "lsi" }, { field = "family", known = false })"),
        "site.toml:3: the conditions exclude each other: family is lsi and family is not "
        "known");
}

TEST(Contradiction, IsFoundWhereNoNameIsLeft) {
    EXPECT_EQ(complaintAbout("fan-critical", R"({ field = "status", not = "normal" },
                                                { field = "status", not = "warning" },
                                                { field = "status", not = "critical" })"),
              "site.toml:3: the conditions exclude each other: status is not normal and status is "
              "not warning and status is not critical");
}

struct Pair {
    const char* first;
    const char* second;
    const char* complaint;
};

TEST(Contradiction, IsFoundByTheCodesThatAreKnown) {
    constexpr auto pairs = std::to_array<Pair>({
        {"is = 99", "known = true", "state is 99 and state is known"},
        {"is = 99", "known = false", ""},
        {"is = 4", "known = false", "state is 4 and state is not known"},
        {"is = 4", "known = true", ""},
        {"in = [4, 99]", "known = false", ""},
        {"in = [\"failed\", 99]", "known = false", ""},
        {"above = 90", "known = true", "state is above 90 and state is known"},
        {"above = 90", "known = false", ""},
        {"above = 2", "below = 4", ""},
    });
    for (const auto& [first, second, complaint] : pairs) {
        const std::string conditions = "{ field = \"state\", " + std::string{first} +
                                       " }, { field = \"state\", " + second + " }";
        EXPECT_EQ(complaintAbout("disk-drive-failed", conditions),
                  *complaint == '\0' ? ""
                                     : "site.toml:3: the conditions exclude each other: " +
                                           std::string{complaint});
    }
}

TEST(Contradiction, IsFoundWhereTheBoundsHoldKnownCodesOnly) {
    EXPECT_EQ(complaintAbout("disk-drive-failed",
                             R"({ field = "state", above = 2 }, { field = "state", below = 5 },
                                { field = "state", known = false })"),
              "site.toml:3: the conditions exclude each other: state is above 2 and state is below "
              "5 and state is not known");
}

TEST(Contradiction, IsFoundInOneCondition) {
    EXPECT_EQ(complaintAbout("overall-status-critical",
                             R"({ field = "overall_status", )"
                             R"(not_in = ["Normal", "Warning", "Critical"] })"),
              "site.toml:3: no value fulfils the condition: overall_status is none of Normal, "
              "Warning, Critical");
    EXPECT_EQ(
        complaintAbout("hot-spare-missing", R"({ field = "ready_spares", above = 2147483647 })"),
        "site.toml:3: no value fulfils the condition: ready_spares is above 2147483647");
}

// A book may be amended for machines that the rules were not made for.
TEST(Contradiction, IsNotSoughtInOneConditionOnACode) {
    CodeBook book = shippedCodeBook();
    book.define("logical_drives", "raid_level", CodeBook::Codes{{0, "RAID 0"}});
    EXPECT_NO_THROW(static_cast<void>(defaultPolicy(book)));
}

TEST(Contradiction, IsNotSoughtInNamesWhereTheCodeBookHasNone) {
    CodeBook book = shippedCodeBook();
    book.define("fans", "status", CodeBook::Codes{});
    for (const char* const conditions :
         {R"({ field = "status", not = 7 }, { field = "status", known = true })",
          R"({ field = "status", not = "normal" }, { field = "status", not_in = ["warning", 7] })",
          R"({ field = "status", in = ["normal", 7] }, { field = "status", is = 8 })"}) {
        EXPECT_EQ(complaintAbout("fan-critical", conditions, book), "") << conditions;
    }
}

}  // namespace
}  // namespace raidinfo::health
