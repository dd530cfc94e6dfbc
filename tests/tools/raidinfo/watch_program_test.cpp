#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <csignal>
#include <nlohmann/json.hpp>
#include <sstream>

#include "program.h"
#include "simulator.h"

namespace raidinfo::test {
namespace {

using nlohmann::json;
using testing::AllOf;
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

// `script` gives it a terminal.
TEST(WatchCommand, LeavesTheTerminalAsItWas) {
    const Simulator simulator{"small-server.xml"};
    Program watch{{"/usr/bin/env", "TERM=xterm", "script", "--quiet", "--return", "--command",
                   RAIDINFO_PROGRAM " watch", "/dev/null"}};
    watch.waitForOutput("Disk drive 3");
    watch.send("\x03");
    const Result result = watch.finish();
    EXPECT_EQ(result.status, 130);
    EXPECT_THAT(result.output, StartsWith("\x1b[?1049h\x1b[?25l"));
    EXPECT_THAT(result.output, EndsWith("\x1b[?25h\x1b[?1049l"));
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
