#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <csignal>
#include <filesystem>
#include <nlohmann/json.hpp>
#include <sstream>
#include <utility>
#include <vector>

#include "documents.h"
#include "program.h"
#include "scripted.h"
#include "simulator.h"
#include "support/files.h"
#include "unread_terminal.h"

namespace raidinfo::test {
namespace {

using nlohmann::json;
using raid::test::readFile;
using raid::test::writeFile;
using testing::AllOf;
using testing::ContainsRegex;
using testing::EndsWith;
using testing::HasSubstr;
using testing::Not;
using testing::StartsWith;

constexpr auto failure = "set adapter:1/channel:1/drive:3 overallStatus=2";
constexpr auto event = "event type=Critical string=\"Drive failed\"";

TEST(WatchCommand, ShowsTheTreeAgainWhenSomethingHappensAndMarksWhatChanged) {
    Simulator simulator{"small-server.xml"};
    Program watch{raidinfo({"watch", "--interval", "3600"})};
    EXPECT_THAT(watch.waitForOutput("Logical drive 1"), Not(HasSubstr("* ")));
    simulator.command(failure);
    simulator.command(event);
    EXPECT_THAT(watch.waitForOutput("Drive failed"),
                AllOf(HasSubstr("\n* │  ├─ Disk drive 3: Critical"),
                      HasSubstr("\n  │  ├─ Disk drive 2: Normal")));
    watch.signal(SIGINT);
    const Result result = watch.finish();
    EXPECT_EQ(result.status, 130);
    EXPECT_EQ(result.errors, "");
    EXPECT_THAT(result.output, Not(HasSubstr("\x1b")));
}

TEST(WatchCommand, NoticesWhatHappensWithoutAnEvent) {
    Simulator simulator{"small-server.xml"};
    Program watch{raidinfo({"watch", "--interval", "1"})};
    watch.waitForOutput("Logical drive 1");
    simulator.command(failure);
    watch.waitForOutput("* │  ├─ Disk drive 3: Critical");
    watch.signal(SIGINT);
    EXPECT_EQ(watch.finish().status, 130);
}

TEST(WatchCommand, TellsOfAnEventThatChangesNothing) {
    Simulator simulator{"small-server.xml"};
    Program watch{raidinfo({"watch", "--interval", "3600"})};
    watch.waitForOutput("Logical drive 1");
    simulator.command("event type=Warning string=\"Patrol read started\"");
    EXPECT_THAT(watch.waitForOutput("Patrol read started"), Not(HasSubstr("* ")));
    watch.signal(SIGINT);
    EXPECT_EQ(watch.finish().status, 130);
}

TEST(WatchCommand, TellsOfAnAdapterThatComesAndGoes) {
    const auto empty = std::filesystem::current_path() / "no-adapters.xml";
    writeFile(empty, configuration(""));
    Simulator simulator{empty};
    Program watch{raidinfo({"watch", "--interval", "3600"})};
    EXPECT_THAT(watch.waitForOutput("No adapters"), Not(HasSubstr("* ")));
    simulator.command("reload " RAID_EXAMPLES "/small-server.xml\nevent type=Information");
    watch.waitForOutput("* Pellion adapter 1: Normal");
    simulator.command("reload " + empty.string() + "\nevent type=Information");
    watch.waitForOutput("- Pellion adapter 1: gone");
    watch.signal(SIGINT);
    EXPECT_EQ(watch.finish().status, 130);
}

// Each wait for an event after 4 ends at once, for there is 50.
TEST(WatchCommand, GoesOnAfterItsPauseWhereTheNumbersAreInDisorder) {
    const Connection configured = answering(configuration(sampleAdapter()));
    const Connection four = answering(newestEventDocument("4"));
    const Connection awaited = answering("the answer to the wait is not looked at");
    const Connection events = answering(eventBatch({50, 4}));
    const Connection silent{.end = End::hold};
    const ScriptedService service{{four, configured, awaited, awaited, events, four, configured,
                                   awaited, awaited, events, four, configured, awaited, awaited,
                                   events, four, silent}};
    Program watch{raidinfo({"watch", "--interval", "1", "--json"})};
    service.waitFor(16, Stage::answered);
    watch.signal(SIGINT);
    const Result result = watch.finish();
    EXPECT_EQ(result.status, 130);
    EXPECT_THAT(result.output, Not(HasSubstr("service_unavailable")));
}

TEST(WatchCommand, TellsOfEventsWhoseNumbersRepeatOrGoBack) {
    Simulator simulator{"small-server.xml"};
    Program watch{raidinfo({"watch", "--interval", "1"})};
    watch.waitForOutput("Logical drive 1");
    simulator.command("event sequenceNumber=1000 string=first");
    watch.waitForOutput("first");
    simulator.command("event place=last sequenceNumber=1000 string=second\nevent string=third");
    watch.waitForOutput("third");
    EXPECT_THAT(watch.waitForOutput("third"), HasSubstr("second"));
    simulator.command("event place=last sequenceNumber=50 string=lower");
    watch.waitForOutput("lower");
    watch.signal(SIGINT);
    EXPECT_EQ(watch.finish().status, 130);
}

TEST(WatchCommand, WritesADocumentForEachChange) {
    Simulator simulator{"small-server.xml"};
    Program watch{raidinfo({"watch", "--interval", "3600", "--json"})};
    watch.waitForOutput("\n");
    simulator.command(failure);
    simulator.command(event);
    watch.waitForOutput("Critical");
    watch.signal(SIGINT);
    std::istringstream lines{watch.finish().output};
    int documents = 0;
    for (std::string line; std::getline(lines, line); ++documents) {
        EXPECT_EQ(json::parse(line)["data"]["adapters"].size(), 1U);
    }
    EXPECT_GE(documents, 2);
}

TEST(WatchCommand, WritesADocumentAlsoForWhatTheDrawingLeavesOut) {
    Simulator simulator{"small-server.xml"};
    Program watch{raidinfo({"watch", "--interval", "3600", "--json"})};
    EXPECT_THAT(watch.waitForOutput("\n"), Not(HasSubstr("\"blocked\":true")));
    simulator.command("set adapter:1/logical:1 blocked=true\nevent type=Information");
    watch.waitForOutput("\"blocked\":true");
    watch.signal(SIGINT);
    EXPECT_EQ(watch.finish().status, 130);
}

constexpr auto enter = "\x1b[?1049h\x1b[?25l";
constexpr auto leave = "\x1b[?25h\x1b[?1049l";

// `script` gives it a terminal.
std::vector<std::string> onATerminal(const std::string& command) {
    return {"/usr/bin/env", "--default-signal", "TERM=xterm", "script",   "--quiet",
            "--return",     "--command",        command,      "/dev/null"};
}

TEST(WatchCommand, LeavesTheTerminalAsItWasWhateverKeyEndsIt) {
    const Simulator simulator{"small-server.xml"};
    for (const auto& [key, status] : {std::pair{"\x03", 130}, std::pair{"\x1c", 131}}) {
        Program watch{onATerminal(RAIDINFO_PROGRAM " watch")};
        watch.waitForOutput("Disk drive 3");
        watch.send(key);
        const Result result = watch.finish();
        EXPECT_EQ(result.status, status);
        EXPECT_THAT(result.output, StartsWith(enter));
        EXPECT_THAT(result.output, EndsWith(leave));
    }
}

TEST(WatchCommand, KeepsWhatChangedAndTheEventsInSightOnASmallTerminal) {
    Simulator simulator{"small-server.xml"};
    Program watch{
        onATerminal("stty rows 8 columns 60; exec " RAIDINFO_PROGRAM " watch --interval 3600")};
    EXPECT_THAT(watch.waitForOutput("more lines"), Not(HasSubstr("state 1 (online)")));
    simulator.command(failure);
    simulator.command(event);
    EXPECT_THAT(watch.waitForOutput("Drive failed"), HasSubstr("state 1 (online)"));
    watch.send("\x03");
    EXPECT_EQ(watch.finish().status, 130);
}

TEST(WatchCommand, FollowsTheSizeOfTheTerminal) {
    const Simulator simulator{"small-server.xml"};
    Program watch{onATerminal("stty rows 8 columns 60; tty > tty.txt; exec " RAIDINFO_PROGRAM
                              " watch --interval 3600")};
    watch.waitForOutput("more lines");
    const std::string terminal = readFile("tty.txt");
    Program resize{{"/usr/bin/env", "stty", "-F", terminal.substr(0, terminal.find('\n')), "rows",
                    "60", "columns", "200"}};
    EXPECT_EQ(resize.finish().status, 0);
    watch.waitForOutput("Logical drive 1");
    watch.send("\x03");
    EXPECT_EQ(watch.finish().status, 130);
}

TEST(WatchCommand, IsInterruptedAlsoWhenTheTerminalTakesNoPictureOfItsNewSize) {
    const Simulator simulator{"small-server.xml"};
    UnreadTerminal terminal;
    terminal.waitFor("Logical drive 1");
    terminal.fill();
    terminal.resizeUntilFull();
    EXPECT_EQ(terminal.interrupted(), 130);
}

// A shell with job control, for without one nobody could continue it.
TEST(WatchCommand, GivesTheTerminalBackWhileItIsStopped) {
    const Simulator simulator{"small-server.xml"};
    Program watch{onATerminal("exec bash -c 'set -m; " RAIDINFO_PROGRAM
                              " watch --interval 3600; echo stopped; fg >/dev/null'")};
    watch.waitForOutput("Disk drive 3");
    watch.send("\x1a");
    EXPECT_THAT(watch.waitForOutput(enter, 2),
                ContainsRegex("\x1b\\[\\?1049l[^\x1b]*stopped[^\x1b]*\x1b\\[\\?1049h"));
    watch.waitForOutput("Disk drive 3", 2);
    watch.send("\x03");
    const Result result = watch.finish();
    EXPECT_EQ(result.status, 130);
    EXPECT_THAT(result.output, EndsWith(leave));
}

TEST(WatchCommand, DrawsNoPictureInPlaceOnATerminalThatCannot) {
    const Simulator simulator{"small-server.xml"};
    Program watch{{"/usr/bin/env", "TERM=dumb", "script", "--quiet", "--return", "--command",
                   RAIDINFO_PROGRAM " watch", "/dev/null"}};
    watch.waitForOutput("Disk drive 3");
    watch.send("\x03");
    EXPECT_THAT(watch.finish().output, Not(HasSubstr("\x1b[")));
}

}  // namespace
}  // namespace raidinfo::test
