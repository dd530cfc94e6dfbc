#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <filesystem>
#include <nlohmann/json.hpp>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "program.h"
#include "simulator.h"
#include "support/files.h"

namespace raidinfo::test {
namespace {

using nlohmann::json;
using raid::test::readFile;
using raid::test::writeFile;
using testing::HasSubstr;
using testing::MatchesRegex;

// What failDrive changes.
constexpr auto failedDrive =
    "worse   adapter 1: Normal → Critical\n"
    "worse   adapter 1, channel 1, device 3: Normal → Critical, state 1 (online) → 4 (failed)\n";

constexpr auto nothing = "No changes\n";

void expectDone(const std::vector<std::string>& arguments) {
    const Result result = run(arguments);
    EXPECT_EQ(result.status, 0) << result.errors;
}

Result diff(std::vector<std::string> arguments) {
    arguments.insert(arguments.begin(), "diff");
    return run(std::move(arguments));
}

void expectResult(const Result& result, int status, const std::string& output) {
    EXPECT_EQ(result.status, status);
    EXPECT_EQ(result.output, output);
    EXPECT_EQ(result.errors, "");
}

// Nothing on standard output, one line that says why on standard error.
void expectTrouble(const Result& result, const std::string& reason) {
    EXPECT_EQ(result.status, 2);
    EXPECT_EQ(result.output, "");
    EXPECT_THAT(result.errors, MatchesRegex("raidinfo: [^\n]*\n"));
    EXPECT_THAT(result.errors, HasSubstr(reason));
}

// The small server, and the files that the tests save.
class DiffCommand : public testing::Test {
protected:
    ~DiffCommand() override {
        for (const std::string& file : {before, after, recording, other}) {
            std::filesystem::remove(file);
        }
    }

    void failDrive() { service->obey("set adapter:1/channel:1/drive:3 state=4 overallStatus=2"); }

    void saveBeforeAndAfterTheFailure() {
        expectDone({"snapshot", before});
        expectDone({"record", "--for", "0", recording});
        failDrive();
        expectDone({"snapshot", after});
    }

    const std::string before = "before.json";
    const std::string after = "after.json";
    const std::string recording = "saved.rec";
    const std::string other = "other";
    std::optional<Simulator> service{"small-server.xml"};
};

TEST_F(DiffCommand, ComparesTwoFilesWithoutTheService) {
    saveBeforeAndAfterTheFailure();
    service.reset();
    expectResult(diff({before, after}), 1, failedDrive);
    expectResult(diff({before, before}), 0, nothing);
}

TEST_F(DiffCommand, ComparesAFileWithTheServiceAsItIsNow) {
    expectDone({"snapshot", before});
    expectResult(diff({before}), 0, nothing);
    failDrive();
    expectResult(diff({before}), 1, failedDrive);
}

TEST_F(DiffCommand, ComparesRecordingsAsItDoesSnapshots) {
    saveBeforeAndAfterTheFailure();
    expectResult(diff({recording}), 1, failedDrive);
    service.reset();
    expectResult(diff({recording, after}), 1, failedDrive);
    expectResult(diff({recording, before}), 0, nothing);
    expectResult(diff({recording, recording}), 0, nothing);
    expectResult(diff({before, "--from", recording}), 0, nothing);
}

TEST_F(DiffCommand, ComparesWhatTreePrints) {
    writeFile(before, run({"tree", "--json"}).output);
    failDrive();
    expectResult(diff({before}), 1, failedDrive);
}

TEST_F(DiffCommand, ComparesASnapshotThatWasPrinted) {
    for (const char* const output : {"-", "/dev/stdout"}) {
        writeFile(before, run({"snapshot", output, "--json"}).output);
        expectResult(diff({before}), 0, nothing);
    }
}

TEST_F(DiffCommand, TakesTheNamesOfCodesFromTheBookThatItIsGiven) {
    saveBeforeAndAfterTheFailure();
    writeFile(other, "[disk_drives.state]\n1 = \"ready\"\n4 = \"predicted to fail\"\n");
    EXPECT_THAT(diff({before, after, "--codes", other}).output,
                HasSubstr(", state 1 (ready) → 4 (predicted to fail)\n"));
}

TEST_F(DiffCommand, PrintsTheChangesForPrograms) {
    saveBeforeAndAfterTheFailure();
    const Result result = diff({before, after, "--json"});
    EXPECT_EQ(result.status, 1);
    EXPECT_EQ(result.errors, "");
    const json document = json::parse(result.output);
    EXPECT_EQ(document["complete"], true);
    EXPECT_EQ(document["source"], json({{"type", "files"}, {"name", "before.json, after.json"}}));
    const json& changes = document["data"]["changes"];
    ASSERT_EQ(changes.size(), 2U);
    EXPECT_EQ(changes[1]["direction"], "worse");
    EXPECT_EQ(changes[1]["place"], json({{"adapter_id", 1}, {"channel_id", 1}, {"device_id", 3}}));
    const json& state = changes[1]["details"][1];
    EXPECT_EQ(state["before"], 1);
    EXPECT_EQ(state["after"], 4);
    EXPECT_EQ(state["text"], "state 1 (online) → 4 (failed)");
}

TEST_F(DiffCommand, PrintsAnEmptyListForProgramsWhenNothingHasChanged) {
    expectDone({"snapshot", before});
    const Result result = diff({before, "--json"});
    EXPECT_EQ(result.status, 0);
    const json document = json::parse(result.output);
    EXPECT_EQ(document["data"], json({{"changes", json::array()}}));
    EXPECT_EQ(document["source"]["type"], "service");
}

TEST_F(DiffCommand, SaysWhichFileIsNoSnapshotAndWhy) {
    expectDone({"snapshot", before});
    const std::vector<std::pair<std::string, std::string>> reasons{
        {"", "other: not a snapshot: no JSON at byte 1"},
        {"something else\n", "other: not a snapshot: no JSON at byte 1"},
        {readFile(before).substr(0, 1000), "other: not a snapshot: no JSON at byte 1001"},
        {readFile(RAID_EXAMPLES "/small-server.xml"), "other: not a snapshot: no JSON at byte 1"},
        {"{}", "other: not a snapshot: it has no \"schema_version\""},
        {run({"list", "--json"}).output, "other: not a snapshot of a tree: it has no \"adapters\""},
        {"raid-recording 1\nsomething else\n", "other: "},
    };
    for (const auto& [content, reason] : reasons) {
        writeFile(other, content);
        expectTrouble(diff({other, before}), reason);
        expectTrouble(diff({before, other}), reason);
        expectTrouble(diff({other}), reason);
    }
}

TEST_F(DiffCommand, RefusesASnapshotOfAnAnswerThatDidNotCome) {
    expectDone({"snapshot", before});
    service.reset();
    writeFile(other, run({"tree", "--json"}).output);
    expectTrouble(diff({before, other}),
                  "other: the snapshot is not complete: the RAID management service");
}

TEST_F(DiffCommand, SaysWhatItCannotRead) {
    expectDone({"snapshot", before});
    expectTrouble(diff({before, "nowhere"}), "cannot read nowhere: No such file");
    expectTrouble(diff({"no\nwhere"}), "cannot read no\\u{a}where: No such file");
    expectTrouble(diff({"."}), "cannot read .: Is a directory");
    service.reset();
    expectTrouble(diff({before}), "does not answer");
}

TEST_F(DiffCommand, TellsTroubleToPrograms) {
    writeFile(other, "something else\n");
    const Result result = diff({other, "--json"});
    EXPECT_EQ(result.status, 2);
    const json document = json::parse(result.output);
    EXPECT_EQ(document["complete"], false);
    EXPECT_EQ(document["errors"][0]["code"], "bad_input");
    EXPECT_EQ(document["errors"][0]["message"], "other: not a snapshot: no JSON at byte 1");
    EXPECT_TRUE(document["data"].is_null());
}

}  // namespace
}  // namespace raidinfo::test
