// Reading fault files: words, what varies, instructions, and what is wrong with them.

#include "fault/fault_file.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <filesystem>
#include <string>
#include <vector>

#include "files.h"
#include "support/files.h"

namespace raidsim::test {
namespace {

using raid::test::writeFile;
using testing::ElementsAre;
using Kind = FaultStep::Kind;
using Words = std::vector<std::string>;

FaultFile fileOf(const std::string& lines) {
    writeFile("some.fault", "title \"Something goes wrong\"\n" + lines);
    return FaultFile("some.fault");
}

FaultCase caseOf(const std::string& lines) { return fileOf(lines).at(0); }

std::string answered(const std::string& lines, const std::string& good = "<good/>") {
    return answerOf(caseOf(lines), good).bytes;
}

std::vector<Kind> stepsOf(const std::string& lines) {
    std::vector<Kind> kinds;
    for (const FaultStep& step : caseOf(lines).steps)
        kinds.push_back(step.kind);
    return kinds;
}

template <typename Action>
std::string errorOf(Action action) {
    try {
        action();
        return "no error";
    } catch (const FaultError& error) {
        return error.what();
    }
}

std::string mistakeIn(const std::string& lines) {
    return errorOf([&] { fileOf(lines); });
}

TEST(FaultWords, AreSeparatedByBlanksAndKeepThoseInQuotes) {
    EXPECT_EQ(faultWords("send  \t 10\r"), (Words{"send", "10"}));
    EXPECT_EQ(faultWords("body text \"a  b\" c\"d e\"f \"\""),
              (Words{"body", "text", "a  b", "cd ef", ""}));
}

TEST(FaultWords, SpellBytesInQuotes) {
    EXPECT_EQ(faultWords(R"("\n\r\t\0\x41\xfF\\\"")"),
              (Words{std::string("\n\r\t\0A\xFF\\\"", 8)}));
    EXPECT_EQ(faultWords(R"(a\n)"), (Words{R"(a\n)"}));
}

TEST(FaultWords, AreRefusedForAnOpenQuoteOrAnUnknownEscape) {
    EXPECT_EQ(errorOf([] { (void)faultWords("\"a"); }), "a quote is not closed");
    for (const char* const escape : {R"("\q")", R"("\x4")", R"("\xg1")", R"("\)"}) {
        EXPECT_THAT(errorOf([&] { (void)faultWords(escape); }), testing::StartsWith("an escape is"))
            << escape;
    }
}

TEST(FaultFiles, AreNamedAfterTheirFileAndTheirTitle) {
    const auto file = fileOf("# a comment\n\n  # another\n");
    EXPECT_EQ(file.name(), "some");
    EXPECT_EQ(file.title(), "Something goes wrong");
    EXPECT_EQ(file.cases(), 1U);
    EXPECT_EQ(file.at(0).values, "");
}

TEST(FaultFiles, StandForACaseForEveryCombinationOfTheirValues) {
    const auto file = fileOf("vary cut 3..5\nvary text \"a b\" c\nbody text \"{text}{cut}{text}\"");
    ASSERT_EQ(file.cases(), 6U);
    EXPECT_EQ(file.at(0).values, "cut=3, text=a b");
    EXPECT_EQ(file.at(1).values, "cut=3, text=c");
    EXPECT_EQ(file.at(5).values, "cut=5, text=c");
    EXPECT_THAT(answerOf(file.at(4), "").bytes, testing::EndsWith("\n\na b5a b"));
    EXPECT_EQ(errorOf([&] { (void)file.at(6); }), "there are 6 cases, counted from 0");
}

// They are told in one line, also on a terminal.
TEST(FaultFiles, SpellBytesThatAreNoLettersInTheNamesOfTheirCases) {
    const auto file = fileOf("vary bytes \"a\\nb\" \"\\0\\x7f\\xfe\"\nbody text {bytes}\n");
    EXPECT_EQ(file.at(0).values, "bytes=a\\x0Ab");
    EXPECT_EQ(file.at(1).values, "bytes=\\x00\\x7F\\xFE");
}

TEST(FaultFiles, LeaveBracesAloneThatHoldNoName) {
    EXPECT_THAT(answered("body text \"{length} {} {Other} {a b} {open\""),
                testing::EndsWith("\n\n{length} {} {Other} {a b} {open"));
}

TEST(FaultFiles, AreRefusedForANameThatStandsForNothing) {
    EXPECT_EQ(mistakeIn("vary cut 1..2\nsend {cutt}"), "line 3: nothing is called {cutt}");
    EXPECT_EQ(mistakeIn("vary cut 1..2\nsend 1"), "nothing uses {cut}");
}

TEST(FaultFiles, AreRefusedForWhatComesBehindTheEnd) {
    EXPECT_EQ(mistakeIn("end close\nsend 1"), "line 3: the connection has ended");
}

TEST(FaultSteps, AreByDefaultThoseOfAGoodService) {
    EXPECT_THAT(stepsOf(""), ElementsAre(Kind::readRequest, Kind::send, Kind::close));
    EXPECT_THAT(stepsOf("end stall"), ElementsAre(Kind::readRequest, Kind::send, Kind::stall));
    EXPECT_THAT(stepsOf("send nothing"), ElementsAre(Kind::readRequest, Kind::close));
    EXPECT_THAT(stepsOf("read nothing"), ElementsAre(Kind::send, Kind::close));
}

TEST(FaultSteps, StandInTheOrderOfTheLines) {
    const auto steps = caseOf(
                           "read 10\nsend header\ntaken\npieces 3\nsend 20\npause 0.25\nsend rest\n"
                           "read request\nend reset")
                           .steps;
    ASSERT_EQ(steps.size(), 9U);
    EXPECT_EQ(steps[0].kind, Kind::read);
    EXPECT_EQ(steps[0].bytes, 10U);
    EXPECT_EQ(steps[1].bytes, FaultStep::header);
    EXPECT_EQ(steps[2].kind, Kind::taken);
    EXPECT_EQ(steps[3].bytes, 3U);
    EXPECT_EQ(steps[4].bytes, 20U);
    EXPECT_EQ(steps[5].time, std::chrono::milliseconds(250));
    EXPECT_EQ(steps[6].bytes, FaultStep::rest);
    EXPECT_EQ(steps[7].kind, Kind::readRequest);
    EXPECT_EQ(steps[8].kind, Kind::reset);
}

TEST(FaultSteps, BeginWithTheRequestUnlessTheFileSaysOtherwise) {
    EXPECT_TRUE(caseOf("").beginsWithRequest());
    EXPECT_FALSE(caseOf("read nothing\nsend rest\nread request").beginsWithRequest());
    EXPECT_FALSE(caseOf("refuse").beginsWithRequest());
    EXPECT_TRUE(caseOf("refuse").refuses);
}

TEST(FaultAnswers, AreByDefaultGood) {
    const auto answer = answerOf(caseOf(""), "<good/>");
    EXPECT_EQ(answer.bytes,
              "HTTP/1.1 200 OK\nContent-Type: application/soap+xml; charset=\"utf-8\"\n"
              "Content-Length: 7\nConnection: close\n\n<good/>");
    EXPECT_EQ(answer.headerSize, answer.bytes.size() - 7);
}

TEST(FaultAnswers, AreChangedLineByLine) {
    EXPECT_EQ(answered("header text \"h{length}.\"\nbody keep 5\nbody append \"xy\" x3"),
              "h11.<goodxyxyxy");
    EXPECT_EQ(answered("header text a\nheader append b\nbody replace good bad"), "ab<bad/>");
    EXPECT_EQ(answered("header text \"\"\nbody keep 100"), "<good/>");
    writeFile("answer.xml", "<saved/>");
    EXPECT_EQ(answered("header text \"{length} {length} \"\nbody file answer.xml"), "8 8 <saved/>");
}

TEST(FaultAnswers, TakeFilesFromTheFoldersThatTheFaultFileNames) {
    std::filesystem::create_directories("faults/answers");
    writeFile("faults/answers/near.xml", "<near/>");
    writeFile("far.xml", "<far/>");
    const auto bodyFrom = [](const std::string& path) {
        writeFile("faults/some.fault",
                  "title \"Answers otherwise\"\nheader text \"\"\nbody file " + path + "\n");
        return answerOf(FaultFile("faults/some.fault").at(0), "").bytes;
    };
    EXPECT_EQ(bodyFrom("answers/near.xml"), "<near/>");
    EXPECT_EQ(bodyFrom("../far.xml"), "<far/>");
    EXPECT_EQ(bodyFrom(std::filesystem::absolute("far.xml").string()), "<far/>");
}

TEST(FaultAnswers, AreRefusedWhereAChangeCannotBeMade) {
    EXPECT_EQ(errorOf([] { (void)answered("body replace bad good"); }),
              "the answer does not hold \"bad\"");
    EXPECT_EQ(errorOf([] { (void)answered("body append 12345678 x50000000"); }),
              "the answer becomes too long");
}

TEST(FaultOutcomes, SayWhatAHostSees) {
    const auto outcome = caseOf(
                             "call getEvent\ncancel\nexpect configuration kept\n"
                             "expect events lost\nexpect result 0\nexpect next -1\n"
                             "expect count RAIDFan 2\nexpect log 8 ends \"x\\n\"\nexpect open 1\n"
                             "expect within 60")
                             .outcome;
    EXPECT_EQ(outcome.call, HostCall::getEvent);
    EXPECT_TRUE(outcome.cancels);
    EXPECT_EQ(outcome.configuration, Fate::kept);
    EXPECT_EQ(outcome.events, Fate::lost);
    EXPECT_EQ(outcome.result, 0);
    EXPECT_EQ(outcome.next, -1);
    EXPECT_THAT(outcome.counts, ElementsAre(testing::Pair("RAIDFan", 2)));
    ASSERT_EQ(outcome.log.size(), 1U);
    EXPECT_EQ(outcome.log[0].level, 8);
    EXPECT_EQ(outcome.log[0].kind, LogExpectation::Kind::ends);
    EXPECT_EQ(outcome.log[0].text, "x\n");
    EXPECT_EQ(outcome.leftOpen, 1);
    EXPECT_EQ(outcome.within, std::chrono::seconds(60));
}

struct Mistake {
    const char* lines;
    const char* message;
};

constexpr Mistake mistakes[]{
    {"explode", "line 2: unknown instruction \"explode\""},
    {"\nsend", "line 3: usage: send header|body|rest|nothing|N"},
    {"send -1", "line 2: \"-1\" is not a number of bytes"},
    {"send 99999999999", "line 2: \"99999999999\" is not a number of bytes"},
    {"pause soon",
     "line 2: \"soon\" is not a time of 0 to 1000000 seconds with at most three decimals"},
    {"end badly", "line 2: \"badly\" is not one of close, reset, stall"},
    {"meets nobody", "line 2: \"nobody\" is not one of config, events, wait, newest, any"},
    {"body append a 3", "line 2: \"3\" is not a count such as x100"},
    {"body grow 3",
     "line 2: usage: body text T, append T [xCOUNT], keep N, replace OLD NEW, file PATH"},
    {"expect result ten", "line 2: \"ten\" is not a number"},
    {"expect the worst",
     "line 2: usage: expect configuration kept|lost|replaced, events kept|lost|replaced, "
     "result N, next N, count FAMILY N, log LEVEL is|has|ends T, open N, within SECONDS"},
    {"expect log 1 says x", "line 2: \"says\" is not one of is, has, ends"},
    {"vary cut 5..3", "line 2: \"5..3\" is not a range of numbers"},
    {"vary length 1..3", "line 2: usage: vary NAME FIRST..LAST, or vary NAME VALUE VALUE..."},
    {"vary a 0..1000\nvary b 0..1000", "line 3: the file stands for too many cases"},
    {"vary a 1 x\nsend {a}", "line 3: \"x\" is not a number of bytes"},
    {"title", "line 2: usage: title \"SENTENCE\""},
    {"send \"", "line 2: a quote is not closed"},
};

TEST(FaultFiles, AreRefusedWithOneLineThatNamesTheirLine) {
    for (const auto& [lines, message] : mistakes)
        EXPECT_EQ(mistakeIn(lines), message);
}

TEST(FaultFiles, NeedATitle) {
    writeFile("untitled.fault", "send nothing\n");
    EXPECT_EQ(errorOf([] { FaultFile("untitled.fault"); }), "the file has no title");
    EXPECT_THROW(FaultFile("gone.fault"), FileError);
}

}  // namespace
}  // namespace raidsim::test
