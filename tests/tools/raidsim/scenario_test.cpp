#include "control/scenario.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <filesystem>
#include <optional>
#include <set>
#include <string>
#include <vector>

#include "control/player.h"
#include "running_service.h"
#include "state/path.h"
#include "support/files.h"

namespace raidsim {
namespace {

using namespace std::chrono_literals;
using testing::AnyOf;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::StartsWith;

template <typename Parse>
std::string errorOf(Parse parse, std::string_view text) {
    try {
        (void)parse(text);
    } catch (const ScriptError& error) {
        return error.what();
    }
    return "none";
}

std::string scenarioError(std::string_view text) {
    return errorOf([](std::string_view scenario) { return parseScenario(scenario); }, text);
}

// The line numbers of what is performed.
class Played {
public:
    explicit Played(std::string_view text) : player(parseScenario(text)) {}

    std::vector<std::size_t> advanceTo(std::chrono::milliseconds elapsed) {
        std::vector<std::size_t> lines;
        player.advanceTo(elapsed, [&](const ScriptLine& line) { lines.push_back(line.number); });
        return lines;
    }

    ScenarioPlayer player;
};

TEST(Scenario, PerformsEachStepOnceWhenItIsDue) {
    Played played("# fails\n\nat 0 status\nat 1.5 status\r\n  at 1.5 help\nat 3 quit\n");
    EXPECT_EQ(played.player.nextDue(), 0ms);
    EXPECT_THAT(played.advanceTo(0ms), ElementsAre(3));
    EXPECT_EQ(played.player.nextDue(), 1500ms);
    EXPECT_THAT(played.advanceTo(1499ms), IsEmpty());
    EXPECT_THAT(played.advanceTo(1500ms), ElementsAre(4, 5));
    EXPECT_THAT(played.advanceTo(1500ms), IsEmpty());
    EXPECT_THAT(played.advanceTo(1h), ElementsAre(6));
    EXPECT_EQ(played.player.nextDue(), std::nullopt);
}

TEST(Scenario, TimeThatJumpsPerformsEverythingInOrder) {
    Played played("at 1 status\nat 2 status\nat 3 status");
    EXPECT_THAT(played.advanceTo(1h), ElementsAre(1, 2, 3));
}

TEST(Scenario, WithoutStepsIsAtItsEnd) {
    EXPECT_EQ(Played("# nothing\n").player.nextDue(), std::nullopt);
}

TEST(Scenario, StepsActOnTheService) {
    Service service = test::makeService(test::smallSystem());
    ScenarioPlayer player(parseScenario("at 2 event type=Critical\nat 4 event type=Warning"));
    player.advanceTo(2s, [&](const ScriptLine& line) { line.command(service); });
    EXPECT_EQ(service.events().newest(), 1);
    player.advanceTo(4s, [&](const ScriptLine& line) { line.command(service); });
    EXPECT_EQ(service.events().newest(), 2);
}

const std::string aTime = "a time of 0 to 1000000 seconds with at most three decimals";

TEST(Scenario, ErrorsNameTheLine) {
    EXPECT_EQ(scenarioError("\nstatus"),
              "line 2: unknown statement \"status\"; a step starts with \"at SECONDS\" or "
              "\"from SECONDS\"");
    EXPECT_EQ(scenarioError("at soon status"), "line 1: \"soon\" is not " + aTime);
    EXPECT_EQ(scenarioError("at -1 status"), "line 1: \"-1\" is not " + aTime);
    EXPECT_EQ(scenarioError("at nan status"), "line 1: \"nan\" is not " + aTime);
    EXPECT_EQ(scenarioError("at inf status"), "line 1: \"inf\" is not " + aTime);
    EXPECT_EQ(scenarioError("at 1000001 status"), "line 1: \"1000001\" is not " + aTime);
    EXPECT_EQ(scenarioError("at"), "line 1: \"\" is not " + aTime);
    EXPECT_EQ(scenarioError("at 1.0005 status"), "line 1: \"1.0005\" is not " + aTime);
    EXPECT_EQ(scenarioError("at 1.005 status"), "none");
    EXPECT_EQ(scenarioError("from 1 to 2 every 0.3333 status"),
              "line 1: \"0.3333\" is not " + aTime);
    EXPECT_EQ(scenarioError("from 1 to 2 every 1 jitter 0.2500 status"),
              "line 1: \"0.2500\" is not " + aTime);
    EXPECT_EQ(scenarioError("at 1"), "line 1: the step has no command");
    EXPECT_EQ(scenarioError("at 2 status\nat 1 status"),
              "line 2: the step lies before the one above it");
    EXPECT_EQ(scenarioError("at 1 reboot"), "line 1: unknown command \"reboot\"");
    EXPECT_EQ(scenarioError("at 1 set disk:1 a=b"),
              "line 1: set: there is no kind of object \"disk\"");
}

TEST(Scenario, ErrorsOfRepeatsNameTheLine) {
    constexpr const char* usage =
        "line 1: usage: from SECONDS to SECONDS every SECONDS|times NUMBER [jitter SECONDS] "
        "COMMAND";
    EXPECT_EQ(scenarioError("from 1 every 2 status"), usage);
    EXPECT_EQ(scenarioError("from 1 to 2 status"), usage);
    EXPECT_EQ(scenarioError("from 1"), usage);
    EXPECT_EQ(scenarioError("from"), "line 1: \"\" is not " + aTime);
    EXPECT_EQ(scenarioError("from 2 to 1 every 1 status"),
              "line 1: the step ends before it begins");
    EXPECT_EQ(scenarioError("from 1 to 2 every 0 status"),
              "line 1: the step would be carried out more than 1000000 times");
    EXPECT_EQ(scenarioError("from 0 to 1000 every 0.001 status"),
              "line 1: the step would be carried out more than 1000000 times");
    EXPECT_EQ(scenarioError("from 0 to 999.999 every 0.001 status"), "none");
    for (const std::string wrong : {"0", "-1", "1.5", "1000001", "18446744073709551616", "many"}) {
        EXPECT_EQ(scenarioError("at 1 times " + wrong + " status"),
                  "line 1: \"" + wrong + "\" is not a number of times, 1 to 1000000");
    }
    EXPECT_EQ(scenarioError("from 1 to 9 every 2 jitter 2.001 status"),
              "line 1: the jitter is longer than the time between two turns");
    EXPECT_EQ(scenarioError("from 1 to 9 every 2 jitter 2 status"), "none");
    EXPECT_EQ(scenarioError("from 1 to 1 every 2 jitter 1 status"),
              "line 1: the jitter is longer than the time between two turns");
    EXPECT_EQ(scenarioError("from 1 to 9 every 2"), "line 1: the step has no command");
    EXPECT_EQ(scenarioError("at 2 status\nfrom 1 to 9 every 2 status"),
              "line 2: the step lies before the one above it");
    EXPECT_EQ(scenarioError("at 1 advance 5"), "line 1: advance: only the operator can say that");
}

TEST(Scenario, EveryChoiceIsCheckedBeforeItIsPlayed) {
    EXPECT_EQ(scenarioError("at 1 progress drive:0 {5|50|500}"),
              "line 1: progress: \"500\" is neither a percentage nor \"done\"");
    EXPECT_EQ(scenarioError("at 1 progress drive:0 {0..101}"),
              "line 1: progress: \"101\" is neither a percentage nor \"done\"");
    EXPECT_EQ(scenarioError("from 1 to 2 times 102 progress drive:0 {index}"),
              "line 1: progress: \"101\" is neither a percentage nor \"done\"");
    EXPECT_EQ(scenarioError("at 1 {status|reboot}"), "line 1: unknown command \"reboot\"");
    EXPECT_EQ(scenarioError("at 1 set {drive} state=4"), "line 1: nothing is called {drive}");
}

TEST(Scenario, WhatNoDocumentCanHoldIsFoundBeforeItIsPlayed) {
    raid::test::writeFile("two.fault", "title \"Two\"\nvary kept 1..2\nbody keep {kept}\n");
    raid::test::writeFile("drive.xml", "<ac:hardDrive/>");
    constexpr std::array<std::array<std::string_view, 2>, 14> mistakes{{
        {"progress fan:1 50", "progress: no task runs on \"fan\""},
        {"progress fan:1 done", "progress: no task runs on \"fan\""},
        {"remove adapter:1", "remove: \"adapter\" is not added or removed while the system runs"},
        {"remove {drive:1|spares}",
         "remove: \"spares\" is not added or removed while the system runs"},
        {"add adapter:1 like adapter:2",
         "add: \"adapter\" is not added or removed while the system runs"},
        {"add drive:1 like drive:2", "add: drive:1 does not say in which channel"},
        {"add channel:1/drive:1 like fan:2", "add: fan:2 is no drive"},
        {"add channel:1/drive:* from drive.xml", "add: channel:1/drive:* does not name one thing"},
        {"join fan:1 spares", "join: fan:1 is not a drive"},
        {"leave drive:1 adapter:1", "leave: adapter:1 is neither an array nor the spares"},
        {"fault two.fault 2", "fault: there are 2 cases, counted from 0"},
        {"event sequenceNumber=0 type=A",
         "event: sequenceNumber 0 needs a place: numbers start at 1"},
        {"event sequenceNumber=-4", "event: sequenceNumber -4 needs a place: numbers start at 1"},
        {"event sequenceNumber={0..9}",
         "event: sequenceNumber 0 needs a place: numbers start at 1"},
    }};
    for (const auto& [command, complaint] : mistakes) {
        EXPECT_EQ(scenarioError("at 1 status\nat 2 " + std::string(command)),
                  "line 2: " + std::string(complaint));
    }
}

TEST(Scenario, AnyNumberOfAnEventMayBePlayedThatHasAPlace) {
    EXPECT_EQ(scenarioError("at 1 event sequenceNumber=0 place=last"), "none");
    EXPECT_EQ(scenarioError("at 1 event place=before:-4 sequenceNumber=-5"), "none");
    EXPECT_EQ(scenarioError("at 1 event sequenceNumber=1"), "none");
}

// Whether it does shows in the document only: others may have been removed by then.
TEST(Scenario, AStarMayNameTheOneDriveThatThereIs) {
    Service service = test::makeService(test::smallSystem());
    ScenarioPlayer player(parseScenario("at 1 leave channel:2/drive:* spares"));
    player.advanceTo(1s, [&](const ScriptLine& line) { line.command(service); });
    EXPECT_THAT(findAll(service.document().edit(), Path::parse("spares/drive:*")), IsEmpty());
}

TEST(Scenario, LinesMayEndAsOnOtherSystemsAndTheLastOneNotAtAll) {
    Played played("seed 7\r\nlet a help\r\n\r\nat 1 {a}\r\nat 2 status");
    EXPECT_THAT(played.advanceTo(2s), ElementsAre(4, 5));
}

// A message ends at a zero byte.
TEST(Scenario, ControlCharactersAreRefusedWhereverTheyStandButInComments) {
    using namespace std::string_view_literals;
    for (const auto line : {"at\0 1 status"sv, "at 1\0 status"sv, "at 1 sta\0tus"sv, "seed 7\0"sv,
                            "let a\0b c"sv, "\0"sv, "at 1 status\rat 2 status"sv, "\x1b[2J"sv})
        EXPECT_EQ(scenarioError("# \1\n" + std::string(line)), "line 2: a control character");
    EXPECT_EQ(scenarioError("at\t1\tstatus"), "none");
}

TEST(Scenario, HeadsStandOnceBeforeTheSteps) {
    EXPECT_EQ(scenarioError("at 1 status\nseed 5"),
              "line 2: \"seed\" stands before the first step");
    EXPECT_EQ(scenarioError("config a\nconfig b"), "line 2: there are two lines \"config\"");
    EXPECT_EQ(scenarioError("config a b"), "line 1: usage: config FILE");
    EXPECT_EQ(scenarioError("config"), "line 1: usage: config FILE");
    EXPECT_EQ(scenarioError("start now"), "line 1: usage: start YYYY-MM-DDTHH:MM:SSZ");
    EXPECT_EQ(scenarioError("seed -1"), "line 1: usage: seed NUMBER");
    EXPECT_EQ(scenarioError("let drive"), "line 1: usage: let NAME VALUE");
    EXPECT_EQ(scenarioError("let a b\nlet a c"), "line 2: \"a\" has a meaning already");
}

TEST(Scenario, HeadsTellWhatItBeginsWith) {
    const Scenario scenario =
        parseScenario("config \"my server.xml\"\nstart 2026-03-01T00:00:00Z", "folder/of");
    EXPECT_EQ(scenario.config, "folder/of/my server.xml");
    EXPECT_EQ(scenario.start, std::chrono::sys_days(std::chrono::year(2026) / 3 / 1));
    EXPECT_EQ(parseScenario("config /server.xml", "folder").config, "/server.xml");
    EXPECT_EQ(parseScenario("config server.xml").config, "server.xml");
    EXPECT_EQ(parseScenario("").config, "");
    EXPECT_EQ(parseScenario("").start, std::nullopt);
}

TEST(Scenario, NamesStandForWhatTheyWereGivenInEveryStatement) {
    Played played("let second 1\nlet word at {second}\n{word} status\nat {second} status\n");
    EXPECT_THAT(played.advanceTo(1s), ElementsAre(3, 4));
}

// When each turn of one step is due.
std::vector<std::chrono::milliseconds> timesOf(std::string_view text) {
    ScenarioPlayer player(parseScenario(text));
    std::vector<std::chrono::milliseconds> times;
    player.advanceTo(24h, [&](const ScriptLine&) { times.push_back(player.elapsed()); });
    return times;
}

TEST(Scenario, RepeatsAreDueEvenly) {
    EXPECT_THAT(timesOf("from 4 to 8 every 2 status"), ElementsAre(4s, 6s, 8s));
    EXPECT_THAT(timesOf("from 4 to 8 every 3 status"), ElementsAre(4s, 7s));
    EXPECT_THAT(timesOf("from 4 to 8 every 5 status"), ElementsAre(4s));
    EXPECT_THAT(timesOf("from 4 to 8 times 5 status"), ElementsAre(4s, 5s, 6s, 7s, 8s));
    EXPECT_THAT(timesOf("from 0 to 1 times 4 status"), ElementsAre(0ms, 333ms, 666ms, 1000ms));
    EXPECT_THAT(timesOf("from 4 to 4 times 2 status"), ElementsAre(4s, 4s));
    EXPECT_THAT(timesOf("at 4 times 3 status"), ElementsAre(4s, 4s, 4s));
    EXPECT_EQ(timesOf("from 0 to 1 times 1000000 status").size(), 1'000'000U);
}

TEST(Scenario, JitterMakesLateButNeverDisorderly) {
    const auto times = timesOf("from 0 to 100 every 1 jitter 1 status");
    ASSERT_EQ(times.size(), 101U);
    std::set<std::chrono::milliseconds> late;
    for (std::size_t turn = 0; turn < times.size(); ++turn) {
        const auto even = std::chrono::seconds(turn);
        EXPECT_GE(times[turn], even);
        EXPECT_LE(times[turn], even + 1s);
        late.insert(times[turn] - even);
    }
    EXPECT_TRUE(std::ranges::is_sorted(times));
    EXPECT_GT(late.size(), 80U);
    EXPECT_EQ(times, timesOf("from 0 to 100 every 1 jitter 1 status"));
    EXPECT_NE(times, timesOf("seed 1\nfrom 0 to 100 every 1 jitter 1 status"));
}

TEST(Scenario, StepsOfOneTimeAreCarriedOutInTheirOrder) {
    Played played("from 1 to 3 every 1 status\nat 1 times 2 status\nat 2 status\nat 3 status");
    EXPECT_THAT(played.advanceTo(3s), ElementsAre(1, 2, 2, 1, 3, 1, 4));
}

TEST(Scenario, ClockShowsWhenAStepIsDue) {
    ScenarioPlayer player(parseScenario("at 1 status\nat 2.5 status"));
    EXPECT_EQ(player.elapsed(), 0s);
    std::vector<std::chrono::milliseconds> shown;
    player.advanceTo(7s, [&](const ScriptLine&) { shown.push_back(player.elapsed()); });
    EXPECT_THAT(shown, ElementsAre(1s, 2500ms));
    EXPECT_EQ(player.elapsed(), 7s);
}

TEST(RealTime, PassesSoManyTimesAsFast) {
    EXPECT_EQ(realTime(1500ms, 1), 1500ms);
    EXPECT_EQ(realTime(1h, 60), 1min);
    EXPECT_EQ(realTime(1'000'000s, 0.001), 1'000'000'000s);
    EXPECT_EQ(realTime(13243ms, 0.64), 20'692'187us);
    EXPECT_EQ(realTime(86843ms, 3.2), 27'138'437us);
}

TEST(RealTime, IsOneThatTheClockCanCountHoweverLateTheStepIs) {
    const auto longest = realTime(std::chrono::milliseconds::max(), 0.001);
    EXPECT_GT(longest, std::chrono::years(50));
    EXPECT_LT(std::chrono::steady_clock::now(), std::chrono::steady_clock::now() + longest);
    EXPECT_EQ(realTime(std::chrono::milliseconds::max(), 1e6), longest);
}

// All events that a scenario leaves.
std::string eventsAfter(std::string_view text, std::optional<std::uint64_t> seed = {}) {
    Service service = test::makeService(test::smallSystem());
    ScenarioPlayer player(parseScenario(text, {}, seed));
    player.advanceTo(24h, [&](const ScriptLine& line) { line.command(service); });
    return service.events().body(0, 100'000);
}

TEST(Scenario, TurnsFillTheirPlaceholders) {
    Service service = test::makeService(test::smallSystem());
    ScenarioPlayer player(
        parseScenario("from 4 to 8 every 1 progress channel:1/drive:0 {percent}"));
    for (const std::string percent : {"0", "25", "50", "75", "100"}) {
        player.advanceTo(player.nextDue().value(),
                         [&](const ScriptLine& line) { line.command(service); });
        EXPECT_THAT(service.document().body(),
                    testing::HasSubstr(">" + percent + "</as:percentComplete>"));
    }
    EXPECT_EQ(player.nextDue(), std::nullopt);
}

TEST(Scenario, IsTheSameEachTimeForOneSeed) {
    const std::string storm =
        "at 1 times 100 event deviceID={0..1000000} type={a|b|c}\n"
        "at 2 times 100 event deviceID={0..1000000} type={a|b|c}\n";
    EXPECT_EQ(eventsAfter(storm), eventsAfter(storm));
    EXPECT_EQ(eventsAfter(storm), eventsAfter("seed 0\n" + storm));
    EXPECT_NE(eventsAfter(storm), eventsAfter("seed 1\n" + storm));
    EXPECT_EQ(eventsAfter("seed 1\n" + storm, 7), eventsAfter("seed 7\n" + storm));
}

TEST(Scenario, ChoicesDoNotDependOnCommentsOrOnWhatIsPlayedBetween) {
    const std::string step = "from 1 to 5 every 1 event deviceID={0..1000000}\n";
    EXPECT_EQ(eventsAfter(step), eventsAfter("# changed\n\nlet a b\n" + step + "at 2 status\n"));
}

TEST(Scenario, FilesAreNamedFromItsFolder) {
    std::filesystem::create_directory("stories");
    raid::test::writeFile("stories/other.xml", "<ac:system><as:name>elm</as:name></ac:system>");
    Service service = test::makeService(test::smallSystem());
    parseScenario("at 0 reload other.xml", "stories").steps[0].commandAt(0)(service);
    EXPECT_EQ(service.documentPath(), "stories/other.xml");
    parseScript("reload other.xml", "stories").front().command(service);
    EXPECT_EQ(scenarioError("at 0 fault gone.fault"),
              "line 1: fault: gone.fault: No such file or directory");
}

TEST(Scenario, WithAnythingChangedIsReadOrRefusedWithTheLine) {
    const std::string whole =
        "config a.xml\nstart 2026-01-01T00:00:00Z\nseed 5\nlet a b\nat 1 times 3 event "
        "string=\"x {0..9} {a|b} {{\"\nfrom 2 to 3 every 1 jitter 0.5 set {a}drive:1 x=\"y\"\n";
    const std::string bytes = std::string("\0\n\r\"\\{}|.:=#9- ax\x7f\xff", 19);
    for (std::size_t at = 0; at < whole.size(); ++at) {
        EXPECT_THAT(scenarioError(std::string_view(whole).substr(0, at)),
                    AnyOf("none", StartsWith("line ")));
        for (const char byte : bytes) {
            std::string changed = whole;
            changed[at] = byte;
            EXPECT_THAT(scenarioError(changed), AnyOf("none", StartsWith("line "))) << changed;
        }
    }
}

TEST(Script, IsOneCommandALineAndErrorsNameTheLine) {
    EXPECT_EQ(parseScript("# a\nstatus\n\nhelp").size(), 2U);
    const auto scriptError = [](std::string_view text) {
        return errorOf([](std::string_view script) { return parseScript(script); }, text);
    };
    EXPECT_EQ(scriptError("status\nat 1 status"), "line 2: unknown command \"at\"");
    EXPECT_EQ(scriptError("advance 1"), "line 1: advance: only the operator can say that");
}

}  // namespace
}  // namespace raidsim
