#include "control/template.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <set>
#include <string>

#include "control/command.h"

namespace raidsim {
namespace {

using testing::ElementsAre;

std::string at(std::string_view text, Turn turn) {
    return Template::parse(text).at(turn, Draw({turn.number}));
}

template <typename Action>
std::string errorOf(Action action) {
    try {
        (void)action();
    } catch (const CommandError& error) {
        return error.what();
    }
    return "none";
}

std::string templateError(std::string_view text) {
    return errorOf([&] { return Template::parse(text); });
}

TEST(Template, WithoutBracesIsTheSameAtEveryTurn) {
    const Template line = Template::parse("event type=Critical string=\"a } b\"");
    EXPECT_FALSE(line.varies());
    EXPECT_EQ(line.at({}, Draw({})), "event type=Critical string=\"a } b\"");
    EXPECT_THAT(line.samples(9), ElementsAre("event type=Critical string=\"a } b\""));
}

TEST(Template, CountsTheTurns) {
    EXPECT_EQ(at("{count} {index} {percent}%", {0, 5}), "1 0 0%");
    EXPECT_EQ(at("{count} {index} {percent}%", {2, 5}), "3 2 50%");
    EXPECT_EQ(at("{count} {index} {percent}%", {4, 5}), "5 4 100%");
    EXPECT_EQ(at("{count} {index} {percent}%", {0, 1}), "1 0 100%");
}

TEST(Template, ChoosesAmongNumbersAndWords) {
    std::set<std::string> numbers;
    std::set<std::string> words;
    for (std::uint64_t turn = 0; turn < 100; ++turn) {
        numbers.insert(at("{-1..2}", {turn, 100}));
        words.insert(at("{Warning|Critical|}", {turn, 100}));
    }
    EXPECT_THAT(numbers, ElementsAre("-1", "0", "1", "2"));
    EXPECT_THAT(words, ElementsAre("", "Critical", "Warning"));
}

TEST(Template, ChoosesTheSameEachTimeForOneDraw) {
    const Template line = Template::parse("{0..1000000} {0..1000000}");
    EXPECT_EQ(line.at({}, Draw({5})), line.at({}, Draw({5})));
    EXPECT_NE(line.at({}, Draw({5})), line.at({}, Draw({6})));
}

TEST(Template, ReachesAllNumbersOfTheWidestRange) {
    const std::string drawn = at("{-2147483648..2147483647}", {});
    EXPECT_NO_THROW((void)std::stoi(drawn)) << drawn;
}

TEST(Template, TwoBracesStandForOne) {
    EXPECT_EQ(at("a{{b}}{{{count}", {}), "a{b}}{1");
    EXPECT_FALSE(Template::parse("{{count}").varies());
}

TEST(Template, SamplesHoldEveryChoiceAndBothEnds) {
    EXPECT_THAT(Template::parse("{a|b|c} {0..9} {1..2} {count} {percent}").samples(11),
                ElementsAre("a 0 1 1 0", "b 9 2 11 100", "c 0 1 1 0"));
}

TEST(Template, ErrorsSayWhatMayStandInBraces) {
    const std::string allowed =
        " is none of {percent}, {count}, {index}, {LOWEST..HIGHEST}, {THIS|THAT}";
    EXPECT_EQ(templateError("{"), "a brace is not closed; two of them, \"{{\", stand for one");
    for (const char* const wrong :
         {"{}", "{7}", "{1..}", "{..2}", "{2..1}", "{1..2147483648}", "{a..b}", "{1...2}", "{-}"})
        EXPECT_EQ(templateError(wrong), wrong + allowed);
}

TEST(Names, StandForWhatTheyWereGiven) {
    Names names;
    names.define("drive", "adapter:1/drive:3");
    names.define("it-2", "{0..5}");
    EXPECT_EQ(names.replacedIn("set {drive} state={it-2} x={{drive}{count}{a|b}"),
              "set adapter:1/drive:3 state={0..5} x={{drive}{count}{a|b}");
}

TEST(Names, AreGivenOnceAndAreWords) {
    Names names;
    names.define("drive", "x");
    const auto defineError = [&](const std::string& name) {
        return errorOf([&] {
            names.define(name, "y");
            return 0;
        });
    };
    EXPECT_EQ(defineError("drive"), "\"drive\" has a meaning already");
    for (const std::string wrong : {"", "1st", "a b", "a.b", "percent", "count", "index"})
        EXPECT_EQ(defineError(wrong), "\"" + wrong + "\" cannot be a name");
    EXPECT_EQ(errorOf([&] { return names.replacedIn("set {drives}"); }),
              "nothing is called {drives}");
    EXPECT_EQ(errorOf([&] { return names.replacedIn("set {drive"); }),
              "a brace is not closed; two of them, \"{{\", stand for one");
}

}  // namespace
}  // namespace raidsim
