#include "control/scenario.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "running_service.h"

namespace raidsim {
namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::IsEmpty;

template <typename Parse>
std::string errorOf(Parse parse, std::string_view text) {
    try {
        (void)parse(text);
    } catch (const ScriptError& error) {
        return error.what();
    }
    return "none";
}

std::string scenarioError(std::string_view text) { return errorOf(parseScenario, text); }

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

TEST(Scenario, ErrorsNameTheLine) {
    EXPECT_EQ(scenarioError("\nstatus"), "line 2: a step starts with \"at SECONDS\"");
    EXPECT_EQ(scenarioError("at soon status"), "line 1: \"soon\" is not a time in seconds");
    EXPECT_EQ(scenarioError("at -1 status"), "line 1: \"-1\" is not a time in seconds");
    EXPECT_EQ(scenarioError("at nan status"), "line 1: \"nan\" is not a time in seconds");
    EXPECT_EQ(scenarioError("at inf status"), "line 1: \"inf\" is not a time in seconds");
    EXPECT_EQ(scenarioError("at 1000001 status"), "line 1: \"1000001\" is not a time in seconds");
    EXPECT_EQ(scenarioError("at"), "line 1: \"\" is not a time in seconds");
    EXPECT_EQ(scenarioError("at 1"), "line 1: the step has no command");
    EXPECT_EQ(scenarioError("at 2 status\nat 1 status"),
              "line 2: the step lies before the one above it");
    EXPECT_EQ(scenarioError("at 1 reboot"), "line 1: unknown command \"reboot\"");
    EXPECT_EQ(scenarioError("at 1 set disk:1 a=b"),
              "line 1: set: there is no kind of object \"disk\"");
}

TEST(Script, IsOneCommandALineAndErrorsNameTheLine) {
    EXPECT_EQ(parseScript("# a\nstatus\n\nhelp").size(), 2U);
    EXPECT_EQ(errorOf(parseScript, "status\nat 1 status"), "line 2: unknown command \"at\"");
}

}  // namespace
}  // namespace raidsim
