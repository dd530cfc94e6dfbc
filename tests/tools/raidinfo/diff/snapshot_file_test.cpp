#include "diff/snapshot_file.h"

#include <gtest/gtest.h>

#include <string>

#include "trees.h"

namespace raidinfo::diff {
namespace {

using test::Json;

Json file() {
    return {{"schema_version", 1},
            {"generated_at", "2026-11-21T17:48:00Z"},
            {"source", {{"type", "service"}, {"name", "127.0.0.1:34572"}}},
            {"complete", true},
            {"errors", Json::array()},
            {"data", test::smallServer()}};
}

std::string complaintAbout(const std::string& text) {
    try {
        static_cast<void>(snapshotData(text));
    } catch (const SnapshotError& error) {
        return error.what();
    }
    return "none";
}

// A file in which one thing is another.
std::string with(const std::string& key, const Json& value) {
    Json changed = file();
    changed[key] = value;
    return changed.dump();
}

TEST(SnapshotFile, YieldsItsTree) {
    EXPECT_EQ(snapshotData(file().dump()), test::smallServer());
    EXPECT_EQ(snapshotData(file().dump(2) + "\n"), test::smallServer());
}

TEST(SnapshotFile, IsRefusedWhenItIsTheLogicalView) {
    Json data = test::smallServer();
    data["adapters"][0]["hot_spares"] = Json::array();
    EXPECT_EQ(complaintAbout(with("data", data)), "not a snapshot: it is the logical view of one");
}

TEST(SnapshotFile, IsReadInEveryMinorVersion) {
    for (const Json& version : {Json(1), Json("1"), Json("1.0"), Json("1.7")}) {
        EXPECT_EQ(complaintAbout(with("schema_version", version)), "none");
    }
}

TEST(SnapshotFile, IsRefusedInAnotherMajorVersion) {
    EXPECT_EQ(complaintAbout(with("schema_version", 2)),
              "a snapshot of schema version 2, where only version 1 is understood");
    EXPECT_EQ(complaintAbout(with("schema_version", "11.0")),
              "a snapshot of schema version 11, where only version 1 is understood");
    EXPECT_EQ(complaintAbout(with("schema_version", "\n")),
              "a snapshot of schema version \\u{a}, where only version 1 is understood");
}

TEST(SnapshotFile, IsRefusedWhenItWasNotComplete) {
    EXPECT_EQ(complaintAbout(with("complete", false)), "the snapshot is not complete");
    Json incomplete = file();
    incomplete["complete"] = false;
    incomplete["data"] = nullptr;
    incomplete["errors"] = {{{"code", "malformed_answer"}, {"message", "the answer\nis malformed"}},
                            {{"code", "usage"}, {"message", "another"}}};
    EXPECT_EQ(complaintAbout(incomplete.dump()),
              "the snapshot is not complete: the answer\\u{a}is malformed");
}

TEST(SnapshotFile, IsRefusedAsIncompleteWhateverItsErrorsAre) {
    for (const Json& errors : {Json(), Json(3), Json::array({"text"}),
                               Json::array({Json::object()}), Json::array({{{"message", 3}}})}) {
        Json incomplete = file();
        incomplete["complete"] = false;
        incomplete["errors"] = errors;
        EXPECT_EQ(complaintAbout(incomplete.dump()), "the snapshot is not complete") << errors;
    }
}

TEST(SnapshotFile, IsRefusedWhenItIsNoSnapshot) {
    EXPECT_EQ(complaintAbout(""), "not a snapshot: no JSON at byte 1");
    EXPECT_EQ(complaintAbout("{\"schema_version\": 1,"), "not a snapshot: no JSON at byte 22");
    EXPECT_EQ(complaintAbout("\x7f"
                             "ELF\xff"),
              "not a snapshot: no JSON at byte 1");
    EXPECT_EQ(complaintAbout("[1e999]"), "not a snapshot: it holds a number that is too large");
    EXPECT_EQ(complaintAbout("[]"), "not a snapshot: it has no \"schema_version\"");
    EXPECT_EQ(complaintAbout(test::smallServer().dump()),
              "not a snapshot: it has no \"schema_version\"");
    EXPECT_EQ(complaintAbout(with("data", Json::object())),
              "not a snapshot of a tree: it has no \"adapters\"");
    EXPECT_EQ(complaintAbout(with("data", {{"adapters", 3}})),
              "not a snapshot: \"adapters\" is no list");
    EXPECT_EQ(complaintAbout(with("data", {{"adapters", {1, 2}}})),
              "not a snapshot: \"adapters\" holds something without a number \"adapter_id\"");
}

TEST(SnapshotFile, IsRefusedWhenItIsNestedTooDeep) {
    for (const char* const level : {"[", "{\"a\":"}) {
        std::string text;
        for (int depth = 0; depth < 100'000; ++depth) {
            text += level;
        }
        EXPECT_EQ(complaintAbout(text), "not a snapshot: it is nested too deep");
    }
}

TEST(SnapshotFile, IsRefusedInOneLineWhereverItIsCutOff) {
    const std::string whole = with("data", {{"adapters", Json::array()}});
    for (std::size_t length = 0; length < whole.size(); ++length) {
        const std::string complaint = complaintAbout(whole.substr(0, length));
        ASSERT_EQ(complaint.rfind("not a snapshot: no JSON at byte ", 0), 0U) << complaint;
    }
}

}  // namespace
}  // namespace raidinfo::diff
