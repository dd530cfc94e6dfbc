#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <fstream>
#include <nlohmann/json.hpp>
#include <sstream>
#include <string>
#include <vector>

#include "documents.h"
#include "program.h"

namespace raidinfo::test {
namespace {

using nlohmann::json;
using testing::ElementsAre;

std::string entryOf(const std::string& question, const std::string& body) {
    return "answer 0 " + question + " " + std::to_string(body.size()) + "\n" + body + "\n";
}
std::string configurationEntry(const std::string& body) { return entryOf("configuration", body); }
std::string eventsEntry(const std::string& body) { return entryOf("events", body); }

// The codes of all errors, in documents of a line or one document.
std::vector<std::string> codesIn(const Result& result) {
    std::vector<std::string> codes;
    const auto take = [&codes](const json& document) {
        for (const json& error : document["errors"]) {
            codes.push_back(error["code"]);
            EXPECT_EQ(document["complete"], false);
        }
    };
    if (json::accept(result.output)) {
        take(json::parse(result.output));
        return codes;
    }
    std::istringstream lines{result.output};
    for (std::string line; std::getline(lines, line);) {
        take(json::parse(line));
    }
    return codes;
}

const std::string poorFile = "saved.rec";

void writeRecording(const std::vector<std::string>& entries) {
    std::ofstream recording{poorFile};
    recording << "raid-recording 1 2026-11-21T17:48:00Z\n";
    for (const std::string& text : entries) {
        recording << text;
    }
}

Result runFrom(std::vector<std::string> arguments) {
    arguments.insert(arguments.end(), {"--from", poorFile});
    return run(arguments);
}

TEST(PoorRecording, WithoutEventsIsWellWhereNothingHappened) {
    writeRecording({eventsEntry(eventBatch({}))});
    const Result result = runFrom({"events"});
    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.output + result.errors, "");
}

TEST(PoorRecording, WithoutAnAnswerWithEventsHasNoneToShow) {
    for (const std::vector<std::string>& entries : std::vector<std::vector<std::string>>{
             {}, {configurationEntry(configuration(""))}, {"failure 0 events\n"}}) {
        writeRecording(entries);
        const Result result = runFrom({"events"});
        EXPECT_EQ(result.status, 69);
        EXPECT_EQ(result.output, "");
        EXPECT_EQ(result.errors, "raidinfo: the recording holds no events\n");
    }
    EXPECT_THAT(codesIn(runFrom({"events", "--json"})), ElementsAre("service_unavailable"));
}

TEST(PoorRecording, OfMalformedEventsIsMalformed) {
    for (const std::string body : {"<garbage>", "", "<?xml version='1.0'?><env:Envelope>"}) {
        writeRecording({eventsEntry(body)});
        const Result result = runFrom({"events"});
        EXPECT_EQ(result.status, 76) << body;
        EXPECT_EQ(result.output, "");
        EXPECT_THAT(result.errors, testing::MatchesRegex("raidinfo: [^\n]* malformed\n"));
    }
    EXPECT_THAT(codesIn(runFrom({"events", "--json"})), ElementsAre("malformed_answer"));
}

TEST(PoorRecording, TellsOfTheMalformedEventsBetweenOthers) {
    writeRecording({eventsEntry(eventBatch({1})), eventsEntry("<"), eventsEntry(eventBatch({2}))});
    const Result result = runFrom({"events"});
    EXPECT_EQ(result.status, 0);
    EXPECT_THAT(result.output, testing::ContainsRegex("event 1.*\n.*event 2"));
    EXPECT_EQ(result.errors,
              "raidinfo: recorded answers with events that are malformed and left out: 1\n");
    EXPECT_THAT(codesIn(runFrom({"events", "--json"})), ElementsAre("malformed_answer"));
}

TEST(PoorRecording, OfAMalformedConfigurationBehindAnotherShowsThatAndSaysSo) {
    const std::string configured = configurationEntry(configuration(sampleAdapter()));
    writeRecording({configured, configurationEntry("<garbage>")});
    const std::string told =
        "raidinfo: saved.rec: later configurations that are malformed and left out: 1\n";
    for (const std::vector<std::string>& command : std::vector<std::vector<std::string>>{
             {"tree"}, {"health"}, {"snapshot", "saved.json"}, {"list", "fans"}}) {
        EXPECT_EQ(runFrom(command).errors, told);
    }
    EXPECT_THAT(codesIn(runFrom({"tree", "--json"})), ElementsAre("malformed_answer"));
    EXPECT_EQ(run({"diff", poorFile, poorFile}).errors, told + told);
    writeRecording({configurationEntry("<garbage>"), configured});
    EXPECT_EQ(runFrom({"tree"}).errors, "") << "the last one is what counts";
}

TEST(PoorRecording, ThatIsCutShortIsShownAndSaysSo) {
    writeRecording({configurationEntry(configuration(sampleAdapter())),
                    eventsEntry(eventBatch({1})), "answer 5 events 100\n<?xml"});
    const std::string told = poorFile + ": the last entry is cut short and left out";
    for (const std::vector<std::string>& command :
         std::vector<std::vector<std::string>>{{"list"},
                                               {"show", "disk_drives", "0"},
                                               {"tree"},
                                               {"health", "--nagios"},
                                               {"snapshot", "saved.json"},
                                               {"events"}}) {
        const Result result = runFrom(command);
        EXPECT_LT(result.status, 3) << command.front();
        EXPECT_EQ(result.errors, "raidinfo: " + told + "\n") << command.front();
    }
    for (const std::vector<std::string>& command :
         std::vector<std::vector<std::string>>{{"list", "--json"},
                                               {"show", "disk_drives", "0", "--json"},
                                               {"tree", "--json"},
                                               {"health", "--json"},
                                               {"snapshot", "saved.json", "--json"},
                                               {"snapshot", "-"}}) {
        const json document = json::parse(runFrom(command).output);
        const json trouble = {{"code", "recording_cut_short"}, {"message", told}};
        EXPECT_EQ(document["complete"], false) << command.front();
        EXPECT_EQ(document["errors"], json::array({trouble})) << command.front();
        EXPECT_FALSE(document["data"].is_null()) << command.front();
    }
    EXPECT_THAT(codesIn(runFrom({"events", "--json"})), ElementsAre("recording_cut_short"));
}

TEST(PoorRecording, ThatIsCutShortIsComparedAndSaysSo) {
    writeRecording({configurationEntry(configuration(sampleAdapter())), "answer 5 "});
    for (const std::vector<std::string>& command :
         std::vector<std::vector<std::string>>{{"diff", poorFile, poorFile, "--json"},
                                               {"diff", poorFile, "--from", poorFile, "--json"}}) {
        const Result result = run(command);
        EXPECT_EQ(result.status, 0);
        EXPECT_THAT(codesIn(result), ElementsAre("recording_cut_short", "recording_cut_short"));
        EXPECT_EQ(std::ranges::count(result.errors, '\n'), 2);
    }
}

TEST(PoorRecording, ThatIsCutShortBeforeItHoldsAnythingSaysSoInItsFailure) {
    writeRecording({"answer 0 configuration 100\n<?xml"});
    for (const std::string command : {"tree", "events"}) {
        const Result result = runFrom({command});
        EXPECT_EQ(result.status, 69);
        EXPECT_THAT(result.errors,
                    testing::MatchesRegex("raidinfo: the recording holds no [a-z]+; its last entry "
                                          "is cut short\n"));
    }
}

}  // namespace
}  // namespace raidinfo::test
