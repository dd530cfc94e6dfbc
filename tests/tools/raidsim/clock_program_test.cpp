// The program with a clock that stands still until it is told otherwise.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <optional>
#include <string>
#include <vector>

#include "client.h"
#include "program.h"
#include "recording/recording.h"
#include "running_service.h"
#include "support/files.h"

namespace raidsim::test {
namespace {

using namespace std::chrono_literals;
using raid::test::writeFile;
using recording::Question;
using testing::EndsWith;
using testing::HasSubstr;
using testing::Not;
using testing::StartsWith;

class ProgramUnderAVirtualClock : public testing::Test {
protected:
    ProgramUnderAVirtualClock() { writeFile("system.xml", smallSystem()); }

    void start(std::vector<std::string> arguments) {
        arguments.insert(arguments.begin(), {"--port", "0", "--clock", "virtual"});
        program.emplace(arguments);
        const std::string line = program->readLine();
        port = static_cast<std::uint16_t>(std::stoi(line.substr(line.rfind(':') + 1)));
    }
    void play(const std::string& scenario, std::vector<std::string> more = {}) {
        writeFile("play.scenario", "config system.xml\n" + scenario);
        more.insert(more.end(), {"--scenario", "play.scenario"});
        start(more);
    }

    void type(const std::string& line) { program->type(line + "\n"); }
    void advance(const std::string& seconds, const std::string& shown) {
        type("advance " + seconds);
        EXPECT_EQ(line(), "time " + shown);
    }
    std::string line() { return program->readLine(); }
    [[nodiscard]] std::string allEvents() const { return ask(port, getEvents(0, 10'000)); }

    std::optional<Program> program;
    std::uint16_t port = 0;
};

TEST_F(ProgramUnderAVirtualClock, PlaysWhatIsDueWhenItIsToldHowMuchTimePasses) {
    play("at 0 event string=begun\nat 1.5 event string=soon\nat 1000000 event string=ages\n");
    EXPECT_THAT(ask(port, getNewestEvent()), HasSubstr(">1</as:return>"));
    advance("1.499", "1.499");
    EXPECT_THAT(ask(port, getNewestEvent()), HasSubstr(">1</as:return>"));
    advance("0.001", "1.5");
    EXPECT_THAT(ask(port, getNewestEvent()), HasSubstr(">2</as:return>"));
    advance("1000000", "1000001.5");
    EXPECT_THAT(ask(port, getNewestEvent()), HasSubstr(">3</as:return>"));
}

TEST_F(ProgramUnderAVirtualClock, AnswersThoseWhoWaitWhenTheTimeHasCome) {
    play("at 5 event type=Critical\n");
    Client client(port);
    client.send(waitNextEvent(0));
    advance("5", "5");
    EXPECT_THAT(client.receive(), HasSubstr(">1</as:return>"));
}

TEST_F(ProgramUnderAVirtualClock, DatesEventsByTheScenario) {
    play("start 2026-02-28T23:59:58Z\nat 1 event string=a\nat 2.9 event string=b\n");
    advance("1.9", "1.9");
    type("event string=typed");
    advance("60", "61.9");
    EXPECT_THAT(allEvents(), HasSubstr(">2026-02-28T23:59:59Z<"));
    EXPECT_THAT(allEvents(), HasSubstr(">2026-03-01T00:00:00Z<"));
    EXPECT_THAT(allEvents(), Not(HasSubstr(">2026-03-01T00:01:00Z<")));
}

TEST_F(ProgramUnderAVirtualClock, DatesEventsByTheEpochThatItIsGiven) {
    play("start 2026-02-28T23:59:58Z\nat 1 event string=a\n", {"--epoch", "2030-01-01T00:00:00Z"});
    advance("1", "1");
    EXPECT_THAT(allEvents(), HasSubstr(">2030-01-01T00:00:01Z<"));
}

TEST_F(ProgramUnderAVirtualClock, HasADateOfItsOwn) {
    start({"system.xml"});
    type("event type=Critical");
    advance("1", "1");
    EXPECT_THAT(allEvents(), HasSubstr(">2026-01-01T00:00:00Z<"));
}

TEST_F(ProgramUnderAVirtualClock, ChoosesByTheSeedThatItIsGiven) {
    const std::string scenario = "at 1 times 50 event deviceID={0..1000000}\n";
    std::vector<std::string> answers;
    for (const char* const seed : {"1", "1", "2"}) {
        play(scenario, {"--seed", seed});
        advance("1", "1");
        answers.push_back(allEvents());
    }
    EXPECT_EQ(answers[0], answers[1]);
    EXPECT_NE(answers[0], answers[2]);
}

TEST_F(ProgramUnderAVirtualClock, GoesDownAndComesUpByTheScenario) {
    play("at 0 event type=Information\nat 1 down\nat 2 forget\nat 3 up\n");
    advance("1", "1");
    EXPECT_THROW(Client{port}, boost::system::system_error);
    advance("2", "3");
    EXPECT_THAT(ask(port, getNewestEvent()), HasSubstr(">0</as:return>"));
}

TEST_F(ProgramUnderAVirtualClock, GoesOnAfterAFailingStep) {
    play("at 1 set adapter:9 state=4\nat 1 event type=Critical\n");
    advance("1", "1");
    EXPECT_EQ(program->readErrorLine(),
              "raidsim: play.scenario: line 2: set: the document has no adapter:9");
    EXPECT_THAT(ask(port, getNewestEvent()), HasSubstr(">1</as:return>"));
}

TEST_F(ProgramUnderAVirtualClock, QuitsByTheScenario) {
    play("at 1 event type=Critical\nat 2 quit\nat 3 status\n");
    type("advance 5");
    EXPECT_EQ(program->readOutput(), "time 5\n");
    EXPECT_EQ(program->exitStatus(), 0);
}

TEST_F(ProgramUnderAVirtualClock, ServesWhatWasRecorded) {
    writeFile("day.rec",
              recording::heading("2026-11-21T17:48:00Z") +
                  recording::written({0ms, Question::configuration, "<a >\n"}) +
                  recording::written({0ms, Question::newestEvent, "newest"}) +
                  recording::written({2500ms, Question::configuration, std::nullopt}) +
                  recording::written({3s, Question::configuration, std::string("\0\xff", 2)}));
    start({"--replay", "day.rec"});
    EXPECT_THAT(ask(port, getConfig), EndsWith("Content-Length: 5\nConnection: close\n\n<a >\n"));
    EXPECT_THAT(ask(port, getNewestEvent()), EndsWith("\n\nnewest"));
    type("event type=Critical");
    advance("2.5", "2.5");
    EXPECT_EQ(ask(port, getConfig), "");
    EXPECT_THAT(allEvents(), HasSubstr(">2026-11-21T17:48:00Z<"));
    advance("1", "3.5");
    EXPECT_EQ(bodyOf(ask(port, getConfig)), std::string("\0\xff", 2));
    type("status");
    EXPECT_THAT(line(), StartsWith("document day.rec, "));
}

TEST_F(ProgramUnderAVirtualClock, PlaysAScenarioIntoWhatWasRecorded) {
    writeFile("day.rec", recording::heading("2026-11-21T17:48:00Z") +
                             recording::written({0ms, Question::configuration, "<a/>"}));
    play("at 1 down\nat 2 up\n", {"--replay", "day.rec"});
    advance("1", "1");
    EXPECT_THROW(Client{port}, boost::system::system_error);
    advance("1", "2");
    EXPECT_EQ(bodyOf(ask(port, getConfig)), "<a/>");
}

TEST_F(ProgramUnderAVirtualClock, TellsThatARecordingWasCutShort) {
    writeFile("day.rec", recording::heading("2026-11-21T17:48:00Z") + "answer 0 configuration 7\n");
    start({"--replay", "day.rec"});
    EXPECT_EQ(program->readErrorLine(),
              "raidsim: day.rec: the last entry is cut short and left out");
    EXPECT_EQ(ask(port, getConfig), "");
}

TEST(ProgramUnderTheRealClock, ReplaysAsFastAsItIsTold) {
    writeFile("day.rec", recording::heading("2026-11-21T17:48:00Z") +
                             recording::written({0ms, Question::configuration, "<a/>"}) +
                             recording::written(
                                 {20min, Question::events,
                                  "<x><ac:events><ac:event><as:sequenceNumber>7</as:sequenceNumber>"
                                  "</ac:event></ac:events></x>"}));
    Program program({"--replay", "day.rec", "--port", "0", "--speed", "100000"});
    const std::string line = program.readLine();
    const auto port = static_cast<std::uint16_t>(std::stoi(line.substr(line.rfind(':') + 1)));
    EXPECT_THAT(ask(port, waitNextEvent(0)), HasSubstr(">7</as:return>"));
}

TEST(ProgramUnderTheRealClock, WaitsForWhatIsRecordedLaterThanItCanCount) {
    writeFile("day.rec", recording::heading("2026-11-21T17:48:00Z") +
                             recording::written({0ms, Question::configuration, "<a/>"}) +
                             recording::written({std::chrono::milliseconds::max(),
                                                 Question::configuration, "<b/>"}));
    Program program({"--replay", "day.rec", "--port", "0"});
    const std::string line = program.readLine();
    const auto port = static_cast<std::uint16_t>(std::stoi(line.substr(line.rfind(':') + 1)));
    program.type("status\n");
    EXPECT_THAT(program.readLine(), StartsWith("document day.rec, "));
    EXPECT_EQ(bodyOf(ask(port, getConfig)), "<a/>");
}

TEST(ProgramUnderTheRealClock, RefusesToAdvance) {
    writeFile("system.xml", smallSystem());
    Program program({"--port", "0", "system.xml"});
    program.type("advance 1\n");
    EXPECT_EQ(program.readErrorLine(),
              "raidsim: advance: the clock is real; start with --clock virtual");
}

TEST(ProgramUnderTheRealClock, NeedsNoConfigurationBesideAScenarioThatNamesOne) {
    std::filesystem::create_directory("stories");
    writeFile("system.xml", smallSystem());
    writeFile("other.xml", "<ac:system/>");
    writeFile("stories/one.scenario", "config ../system.xml\n");
    Program alone({"--scenario", "stories/one.scenario", "--port", "0"});
    (void)alone.readLine();
    alone.type("status\n");
    EXPECT_THAT(alone.readLine(), StartsWith("document stories/../system.xml, "));
    Program overridden({"--scenario", "stories/one.scenario", "--port", "0", "other.xml"});
    (void)overridden.readLine();
    overridden.type("status\n");
    EXPECT_THAT(overridden.readLine(), StartsWith("document other.xml, "));
}

}  // namespace
}  // namespace raidsim::test
