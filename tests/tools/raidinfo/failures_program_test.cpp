#include <fcntl.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/stat.h>

#include <csignal>
#include <nlohmann/json.hpp>
#include <tuple>
#include <utility>

#include "documents.h"
#include "program.h"
#include "scripted.h"
#include "simulator.h"
#include "support/busy_service.h"
#include "support/files.h"
#include "support/socket.h"

namespace raidinfo::test {
namespace {

using nlohmann::json;
using raid::test::BusyService;
using raid::test::writeFile;
using testing::HasSubstr;
using testing::MatchesRegex;

// Nothing on standard output, one line that says why on standard error.
void expectFailure(const Result& result, int status, const std::string& reason) {
    EXPECT_EQ(result.status, status);
    EXPECT_EQ(result.output, "");
    EXPECT_THAT(result.errors, MatchesRegex("raidinfo: [^\n]*\n"));
    EXPECT_THAT(result.errors, HasSubstr(reason));
}

TEST(FailingProgram, SaysThatTheServiceDoesNotAnswer) {
    for (const std::string command : {"list", "tree", "events", "watch"}) {
        expectFailure(run({command}), 69, "does not answer");
    }
}

TEST(FailingProgram, WritesOneDocumentThatSaysWhyForPrograms) {
    for (const auto& [arguments, status, code] :
         std::vector<std::tuple<std::vector<std::string>, int, std::string>>{
             {{"list", "--json"}, 69, "service_unavailable"},
             {{"events", "--json"}, 69, "service_unavailable"},
             {{"lists", "--json"}, 64, "usage"},
             {{"tree", "--json", "--library", "nowhere.so"}, 72, "unusable_library"},
             {{"tree", "--json", "--from", "nowhere"}, 66, "no_input"}}) {
        const Result result = run(arguments);
        EXPECT_EQ(result.status, status);
        EXPECT_THAT(result.errors, MatchesRegex("raidinfo: [^\n]*\n"));
        const json document = json::parse(result.output);
        EXPECT_EQ(document["complete"], false);
        EXPECT_EQ(document["errors"].size(), 1U);
        EXPECT_EQ(document["errors"][0]["code"], code);
        EXPECT_TRUE(document["data"].is_null());
    }
}

TEST(FailingProgram, KeepsItsStatusAndItsOutputWithoutAStandardError) {
    Program program{{"/bin/sh", "-c", "exec \"$0\" tree --json 2>&-", RAIDINFO_PROGRAM}};
    const Result result = program.finish();
    EXPECT_EQ(result.status, 69);
    EXPECT_EQ(json::parse(result.output)["errors"][0]["code"], "service_unavailable");
}

TEST(FailingProgram, SaysThatTheServiceClosesWithoutAnAnswer) {
    const ScriptedService service{{Connection{}, Connection{}}};
    expectFailure(run({"list"}), 69, "does not answer");
}

TEST(FailingProgram, SaysThatTheAnswerIsMalformed) {
    const std::string cut = configuration(sampleAdapter()).substr(0, 900);
    const ScriptedService service{
        {answering(cut), answering(newestEventDocument("0")), answering(cut)}};
    expectFailure(run({"tree"}), 76, "malformed");
}

TEST(FailingProgram, SaysThatTheEventsAreMalformed) {
    const std::string batch = eventBatch({1}).substr(0, 400);
    std::vector<Connection> connections;
    for (int read = 0; read < 5; ++read) {
        connections.push_back(answering(newestEventDocument("1")));
        connections.push_back(answering(""));
        connections.push_back(answering(batch));
    }
    const ScriptedService service{connections};
    expectFailure(run({"events"}), 76, "malformed");
}

TEST(FailingProgram, GivesUpOnASilentServiceAfterTheTimeout) {
    const ScriptedService service{{Connection{.end = End::hold}}};
    expectFailure(run({"list", "--timeout", "1"}), 69, "--timeout");
}

TEST(FailingProgram, CallsASilentServiceSilentInAVerdict) {
    const ScriptedService service{{Connection{.end = End::hold}}};
    const Result result = run({"health", "--timeout", "1"});
    EXPECT_EQ(result.status, 3);
    EXPECT_THAT(result.output, HasSubstr("UNKNOWN: the RAID management service gave no answer"));
}

// Too little address space for the buffer of texts.
TEST(FailingProgram, TellsOfWhatItLacksInTheFormThatWasAskedFor) {
    const auto inLittleSpace = [](const std::string& arguments) {
        const ScriptedService service{{answering(configuration(sampleAdapter()))}};
        return Program{
            {"/bin/sh", "-c", "ulimit -v 600000; exec \"$0\" " + arguments, RAIDINFO_PROGRAM}}
            .finish();
    };
    const Result monitored = inLittleSpace("health --nagios");
    EXPECT_EQ(monitored.status, 3);
    EXPECT_THAT(monitored.output, MatchesRegex("RAID UNKNOWN - [^\n]*\n"));
    const Result listed = inLittleSpace("list --json");
    EXPECT_EQ(listed.status, 70);
    EXPECT_EQ(json::parse(listed.output)["errors"][0]["code"], "internal_error");
}

TEST(FailingProgram, DoesNotReadAFileWithoutEnd) {
    expectFailure(run({"tree", "--from", "/dev/zero"}), 65, "longer than");
}

TEST(FailingProgram, GivesUpOnAServiceThatAcceptsNoConnection) {
    const BusyService service;
    expectFailure(run({"list", "--timeout", "1"}), 69, "--timeout");
}

TEST(FailingProgram, SaysWhichFileLacksTheCodeThatThePolicyNeeds) {
    writeFile("own-codes.toml", "[disk_drives.state]\n1 = \"fine\"\n");
    const Result result = run({"health", "--codes", "own-codes.toml"});
    EXPECT_EQ(result.status, 3);
    EXPECT_THAT(result.errors, HasSubstr("known: fine (own-codes.toml:1)"));
}

TEST(FailingProgram, SaysWhatEachListCouldBeFilteredBy) {
    expectFailure(run({"list", "--filter", "state=onlin"}), 64,
                  "logical_drives: \"onlin\" cannot be compared with state, which is a number or, "
                  "for = and !=, one of degraded, normal, offline, rebuilding, unknown, or, for ~, "
                  "a part of one");
    expectFailure(run({"list", "--filter", "colour=red"}), 64, "no list has all the columns");
}

TEST(FailingProgram, IsInterruptedWhileItWaitsForTheInventory) {
    const ScriptedService service{{Connection{.end = End::hold}}};
    Program program{raidinfo({"tree"})};
    service.waitFor(0, Stage::answered);
    program.signal(SIGINT);
    const Result result = program.finish();
    EXPECT_EQ(result.status, 130);
    EXPECT_EQ(result.output + result.errors, "");
}

TEST(FailingProgram, IsInterruptedWhileItWaitsForAFile) {
    ASSERT_EQ(mkfifo("silent.rec", 0600), 0);
    Program program{raidinfo({"tree", "--from", "silent.rec"})};
    // Opens once the program has opened the other end.
    const raid::test::Socket writer{open("silent.rec", O_WRONLY | O_CLOEXEC)};
    program.signal(SIGINT);
    EXPECT_EQ(program.finish().status, 130);
}

TEST(FailingProgram, SaysWhyTheLibraryCannotBeLoaded) {
    expectFailure(run({"list", "--library", "nowhere.so"}), 72, "./nowhere.so");
}

TEST(FailingProgram, SaysWhatALibraryLacks) {
    expectFailure(run({"list", "--library", RAID_UNFIT_LIBRARY}), 72, "cancelGetEvent");
}

TEST(FailingProgram, RefusesAWrongCommandLine) {
    expectFailure(run({}), 64, "expected one of list, show, tree, events");
    expectFailure(run({"lists"}), 64, "\"lists\" is no subcommand; there are list, show, ");
    expectFailure(run({"list", "--jsn"}), 64, "--jsn");
}

TEST(FailingProgram, RefusesAWrongFilterBeforeItAsksTheService) {
    expectFailure(run({"list", "disk_drives", "--filter", "nokey=1"}), 64, "nokey");
    expectFailure(run({"list", "--filter", "overall_status=Bogus"}), 64, "Critical or unknown");
}

// A monitoring system takes any other status for that of a plugin that is broken.
TEST(FailingProgram, RefusesAWrongCommandLineAlsoWhereItHasStatusesOfItsOwn) {
    const Result result = run({"health", "--nagios", "--bogus"});
    EXPECT_EQ(result.status, 3);
    EXPECT_THAT(result.output, MatchesRegex("RAID UNKNOWN - [^\n]*--bogus[^\n]*\n"));
    EXPECT_THAT(result.errors, HasSubstr("--bogus"));
    EXPECT_EQ(run({"health", "--nagios", "--json"}).status, 3);
    expectFailure(run({"health", "--bogus"}), 64, "--bogus");
    expectFailure(run({"diff"}), 64, "before");
}

TEST(FailingProgram, SaysThatItsOutputCannotBeWritten) {
    const ScriptedService service{{answering(configuration(""))}};
    expectFailure(
        Program{{"/bin/sh", "-c", "exec \"$0\" list >/dev/full", RAIDINFO_PROGRAM}}.finish(), 74,
        "No space left on device");
}

// The subcommand, and how it ends where it must print and cannot.
Result withoutOutput(const std::string& arguments) {
    return Program{{"/bin/sh", "-c", "exec \"$0\" " + arguments + " >&-", RAIDINFO_PROGRAM}}
        .finish();
}

TEST(FailingProgram, SaysThatItHasNoStandardOutput) {
    const Simulator service{"small-server.xml"};
    EXPECT_EQ(withoutOutput("snapshot before.json").status, 0);
    for (const auto& [arguments, status] :
         {std::pair{"list", 74}, {"diff before.json", 2}, {"health", 3}, {"--version", 74}}) {
        expectFailure(withoutOutput(arguments), status, "cannot write the output");
    }
}

TEST(FailingProgram, KeepsTheStatusOfAFailureThatItCannotTellOnStandardOutput) {
    for (const auto& [arguments, status] : {std::pair{"tree --json", 69},
                                            {"diff nowhere.json --json", 2},
                                            {"health --json", 3},
                                            {"health --nagios", 3},
                                            {"list nothing --json", 64}}) {
        const Result result = withoutOutput(arguments);
        EXPECT_EQ(result.status, status) << arguments;
        EXPECT_THAT(result.errors, MatchesRegex("raidinfo: [^\n]*\n")) << arguments;
    }
}

TEST(FailingProgram, NeedsNoStandardOutputToWriteAFile) {
    const Simulator service{"small-server.xml"};
    EXPECT_EQ(withoutOutput("record --for 0 saved.rec").status, 0);
    EXPECT_EQ(run({"tree", "--from", "saved.rec"}).status, 0);
}

TEST(Program, LoadsTheLibraryThatItIsTold) {
    const ScriptedService service{{answering(configuration(""))}};
    EXPECT_EQ(run({"list", "--library", RAID_LIBRARY}).status, 0);
}

TEST(Program, PrintsHelpAndVersionOnStandardOutput) {
    for (const std::string option : {"--help", "--version"}) {
        const Result result = run({option});
        EXPECT_EQ(result.status, 0);
        EXPECT_THAT(result.output, HasSubstr("raidinfo "));
        EXPECT_EQ(result.errors, "");
    }
}

}  // namespace
}  // namespace raidinfo::test
