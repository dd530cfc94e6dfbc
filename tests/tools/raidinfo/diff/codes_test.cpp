#include <gtest/gtest.h>

#include <algorithm>
#include <regex>
#include <sstream>
#include <string>

#include "codebook/code_book.h"
#include "diff/diff.h"
#include "support/files.h"
#include "trees.h"

namespace raidinfo::diff {
namespace {

using namespace test;
using raid::test::readFile;

// Two snapshots of the small server, of which a test edits the later one, and a code book.
class ChangesOfCodes : public testing::Test {
protected:
    [[nodiscard]] std::string told() const { return diff::told(changes(before, after, book)); }

    Json before = smallServer();
    Json after = before;
    CodeBook book = codes();
};

TEST_F(ChangesOfCodes, ShowTheNameBesideTheNumber) {
    driveOf(after, 1, 3)["state"] = 3;
    enclosureOf(after)["fans"][1]["status"] = 2;
    EXPECT_EQ(
        told(),
        "worse   adapter 1, channel 1, device 3: state 1 (online) → 3 (rebuilding)\n"
        "worse   adapter 1, channel 1, enclosure 8, fan 1: status 0 (normal) → 2 (critical)\n");
}

TEST_F(ChangesOfCodes, ShowTheUnitOfASize) {
    adapterOf(after)["stripe_unit_size"] = 64;
    adapterOf(after)["channels"][1]["transfer_speed"] = 160;
    EXPECT_EQ(told(),
              "        adapter 1: stripe unit size 0 KB → 64 KB\n"
              "        adapter 1, channel 2: transfer speed 320 MB/s → 160 MB/s\n");
}

TEST_F(ChangesOfCodes, FollowTheNamesToOtherNumbers) {
    book.define("disk_drives", "state", CodeBook::Codes{{1, "failed"}, {30, "online"}});
    driveOf(after, 1, 3)["state"] = 30;
    EXPECT_EQ(told(), "better  adapter 1, channel 1, device 3: state 1 (failed) → 30 (online)\n");
}

TEST_F(ChangesOfCodes, AreNeitherWorseNorBetterWhereANameHasNoGrade) {
    book.define("disk_drives", "state", CodeBook::Codes{{1, "online"}, {2, "copying back"}});
    driveOf(after, 1, 3)["state"] = 2;
    EXPECT_EQ(told(),
              "        adapter 1, channel 1, device 3: state 1 (online) → 2 (copying back)\n");
}

TEST_F(ChangesOfCodes, AreNeitherWorseNorBetterWhereACodeHasNoName) {
    driveOf(before, 1, 3)["state"] = 4;
    driveOf(after, 1, 3)["state"] = 17;
    logicalDriveOf(after, 0)["state"] = 17;
    EXPECT_EQ(told(),
              "        adapter 1, channel 1, device 3: state 4 (failed) → 17 (unknown)\n"
              "        adapter 1, logical drive 0: state 0 (normal) → 17 (unknown)\n");
}

TEST_F(ChangesOfCodes, AreTakenFromTheBookForEveryFamilyOfAdapters) {
    for (const char* const family : {"pellion", "lsi", "vantry"}) {
        for (Json* const tree : {&before, &after}) {
            adapterOf(*tree)["family"] = family;
        }
        adapterOf(before)["battery_status"] = 1;
        adapterOf(after)["battery_status"] = 2;
        EXPECT_EQ(told(), "worse   adapter 1: battery status 1 (good) → 2 (charging)\n");
    }
}

TEST_F(ChangesOfCodes, ShowNumbersThatTheServiceCannotSendAsTheyAre) {
    driveOf(after, 1, 0)["state"] = 5'000'000'000;
    driveOf(after, 1, 1)["state"] = -5'000'000'000;
    driveOf(after, 1, 2)["size"] = 1.5;
    EXPECT_EQ(told(),
              "        adapter 1, channel 1, device 0: state 1 (online) → 5000000000\n"
              "        adapter 1, channel 1, device 1: state 1 (online) → -5000000000\n"
              "        adapter 1, channel 1, device 2: size 70006 MB → 1.5\n");
}

TEST_F(ChangesOfCodes, KeepTheNamesOfABookFromTheTerminal) {
    book.define("disk_drives", "state", CodeBook::Codes{{1, "on\nline"}});
    driveOf(after, 1, 3)["state"] = 2;
    EXPECT_EQ(told(),
              "        adapter 1, channel 1, device 3: state 1 (on\\u{a}line) → 2 (unknown)\n");
}

TEST_F(ChangesOfCodes, LeaveTheRawNumbersToPrograms) {
    driveOf(after, 1, 3)["state"] = 4;
    const Json detail = changesData(changes(before, after, book))["changes"][0]["details"][0];
    EXPECT_EQ(detail["before"], 1);
    EXPECT_EQ(detail["after"], 4);
    EXPECT_EQ(detail["text"], "state 1 (online) → 4 (failed)");
}

TEST(OverallStatus, GetsWorseOrBetter) {
    const Json before = smallServer();
    Json after = before;
    logicalDriveOf(after, 0)["overall_status"] = "Critical";
    logicalDriveOf(after, 1)["overall_status"] = "Warning";
    EXPECT_EQ(told(changes(before, after, codes())),
              "worse   adapter 1, logical drive 0: Normal → Critical\n"
              "worse   adapter 1, logical drive 1: Normal → Warning\n");
    EXPECT_EQ(told(changes(after, before, codes())),
              "better  adapter 1, logical drive 0: Critical → Normal\n"
              "better  adapter 1, logical drive 1: Warning → Normal\n");
}

TEST(OverallStatus, WithoutAWordIsWorseThanNormal) {
    const Json before = smallServer();
    Json after = before;
    logicalDriveOf(after, 0)["overall_status"] = nullptr;
    EXPECT_EQ(told(changes(before, after, codes())),
              "worse   adapter 1, logical drive 0: Normal → unknown\n");
}

TEST(Faults, AreWorseWhenTheyBegin) {
    const Json before = smallServer();
    Json after = before;
    driveOf(after, 1, 3)["smart_error"] = true;
    logicalDriveOf(after, 0)["blocked"] = true;
    EXPECT_EQ(told(changes(before, after, codes())),
              "worse   adapter 1, channel 1, device 3: SMART error\n"
              "worse   adapter 1, logical drive 0: became blocked\n");
    EXPECT_EQ(told(changes(after, before, codes())),
              "better  adapter 1, channel 1, device 3: no longer a SMART error\n"
              "better  adapter 1, logical drive 0: no longer blocked\n");
}

// A field that tells how a record is, and a record that has it.
struct StateField {
    std::string kind;
    std::string key;
    Json& (*recordIn)(Json& tree);
};

constexpr int perColumn = 100;

void PrintTo(const StateField& field, std::ostream* output) {
    *output << field.kind << "." << field.key;
}

// The names in the field's row of the document's table, as codes: those of the first column from 0,
// of the next ones from 100 and from 200.
CodeBook::Codes documentedNames(const std::string& key) {
    const std::string document = readFile(RAIDINFO_DIFF_DOCUMENT);
    std::smatch row;
    std::regex_search(
        document, row,
        std::regex{"\\| [^|\n]*`" + key + "`[^|\n]* \\| (.+) \\| (.+) \\| (.+) \\|\n"});
    CodeBook::Codes names;
    for (std::size_t column = 1; column < row.size(); ++column) {
        std::istringstream cell{row[column]};
        int code = perColumn * static_cast<int>(column - 1);
        for (std::string name; std::getline(cell >> std::ws, name, ',');) {
            names.emplace(code++, name);
        }
    }
    return names;
}

class EveryNameOfAState : public testing::TestWithParam<StateField> {
protected:
    EveryNameOfAState() { book.define(GetParam().kind, GetParam().key, documented); }

    [[nodiscard]] Direction direction(int before, int after) const {
        const auto found = changes(with(before), with(after), book);
        return found.empty() ? Direction::neutral : found.front().direction;
    }

    const CodeBook::Codes documented = documentedNames(GetParam().key);

private:
    [[nodiscard]] static Json with(int code) {
        Json tree = smallServer();
        GetParam().recordIn(tree)[GetParam().key] = code;
        return tree;
    }

    CodeBook book;
};

TEST_P(EveryNameOfAState, IsGradedAsDocumented) {
    const auto inWords = [](int before, int after) {
        if (before / perColumn == after / perColumn) {
            return Direction::neutral;
        }
        return before < after ? Direction::worse : Direction::better;
    };
    EXPECT_GT(documented.size(), 3U);
    for (const auto& [before, former] : documented) {
        for (const auto& [after, present] : documented) {
            EXPECT_EQ(direction(before, after), inWords(before, after))
                << former << ", " << present;
        }
    }
}

TEST_P(EveryNameOfAState, InTheShippedCodeBookIsGraded) {
    const CodeBook::Codes* const shipped = codes().codes(GetParam().kind, GetParam().key);
    ASSERT_NE(shipped, nullptr);
    for (const auto& [code, name] : *shipped) {
        EXPECT_TRUE(std::ranges::any_of(documented, [&name = name](const auto& known) {
            return known.second == name;
        })) << name;
    }
}

INSTANTIATE_TEST_SUITE_P(
    OfTheSmallServer, EveryNameOfAState,
    testing::Values(
        StateField{"adapters", "battery_status", adapterOf},
        StateField{"disk_drives", "state", [](Json& tree) -> Json& { return driveOf(tree, 1, 3); }},
        StateField{"logical_drives", "state",
                   [](Json& tree) -> Json& { return logicalDriveOf(tree, 0); }},
        StateField{"enclosures", "state", enclosureOf},
        StateField{"fans", "status",
                   [](Json& tree) -> Json& { return enclosureOf(tree)["fans"][0]; }},
        StateField{"power_supplies", "status",
                   [](Json& tree) -> Json& { return enclosureOf(tree)["power_supplies"][0]; }},
        StateField{
            "temperature_sensors", "status",
            [](Json& tree) -> Json& { return enclosureOf(tree)["temperature_sensors"][0]; }}),
    [](const auto& field) { return field.param.kind; });

}  // namespace
}  // namespace raidinfo::diff
