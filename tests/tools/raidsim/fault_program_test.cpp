// The program while a fault is armed.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

#include "client.h"
#include "program.h"
#include "running_service.h"
#include "support/files.h"

namespace raidsim::test {
namespace {

using raid::test::writeFile;
using testing::EndsWith;
using testing::StartsWith;

class MisbehavingProgram : public testing::Test {
protected:
    MisbehavingProgram() {
        writeFile("system.xml", smallSystem());
        writeFile("cut.fault",
                  "title \"Answers with less\"\nvary kept 1..2\nheader text \"\"\nbody text abc\n"
                  "body keep {kept}\n");
        writeFile("mixed.fault",
                  "title \"Has a mistake in its midst\"\nvary kept 1 many 2\nheader text \"\"\n"
                  "body text abc\nbody keep {kept}\n");
        writeFile("stall.fault", "title \"Stalls\"\nsend nothing\nend stall\n");
        writeFile("deaf.fault", "title \"Answers at once\"\nread nothing\nbody text now\n");
        writeFile("refuse.fault", "title \"Is not there\"\nrefuse\n");
        writeFile("newest.fault", "title \"Knows no event\"\nmeets newest\nbody text none\n");
        writeFile("unfit.fault", "title \"Replaces what is not there\"\nbody replace x<x y\n");
    }

    Program& start(std::vector<std::string> arguments) {
        arguments.insert(arguments.begin(), {"--port", "0"});
        arguments.emplace_back("system.xml");
        program.emplace(arguments);
        const auto line = program->readLine();
        port = static_cast<std::uint16_t>(std::stoi(line.substr(line.rfind(':') + 1)));
        return *program;
    }

    void type(const std::string& line) { program->type(line + "\n"); }
    std::string line() { return program->readLine(); }

    std::optional<Program> program;
    std::uint16_t port = 0;
};

TEST_F(MisbehavingProgram, PlaysEveryCaseOfItsFileAndIsThenGood) {
    start({"--fault", "cut.fault"});
    EXPECT_EQ(ask(port, getConfig), "a");
    EXPECT_EQ(ask(port, getConfig), "ab");
    EXPECT_THAT(ask(port, getConfig), StartsWith("HTTP/1.1 200 OK\n"));
    EXPECT_EQ(line(), "fault: cut case 0: kept=1");
    EXPECT_EQ(line(), "fault: over");
    EXPECT_EQ(line(), "fault: cut case 1: kept=2");
    EXPECT_EQ(line(), "fault: over");
}

TEST_F(MisbehavingProgram, PlaysOneCaseWhenItIsToldOne) {
    start({});
    type("fault cut.fault 1");
    EXPECT_EQ(line(), "fault: armed cut");
    EXPECT_EQ(ask(port, getConfig), "ab");
    EXPECT_THAT(ask(port, getConfig), StartsWith("HTTP/1.1 200 OK\n"));
}

TEST_F(MisbehavingProgram, MeetsOnlyTheRequestThatTheFaultIsFor) {
    start({"--fault", "newest.fault"});
    EXPECT_THAT(ask(port, getConfig), EndsWith("</env:Envelope>\n"));
    EXPECT_THAT(ask(port, getEvents(0, 1)), EndsWith("</env:Envelope>\n"));
    EXPECT_THAT(ask(port, getNewestEvent()), EndsWith("\n\nnone"));
}

TEST_F(MisbehavingProgram, AnswersAClientThatSaysNothing) {
    start({"--fault", "deaf.fault"});
    Client client(port);
    client.endSending();
    EXPECT_THAT(client.receive(), EndsWith("\n\nnow"));
}

TEST_F(MisbehavingProgram, StallsUntilItIsToldToStop) {
    start({"--fault", "stall.fault"});
    Client client(port);
    client.send(getConfig);
    EXPECT_EQ(line(), "fault: stall case 0");
    EXPECT_EQ(line(), "fault: stalled");
    EXPECT_FALSE(client.isAnswered());
    type("fault off");
    EXPECT_EQ(client.receive(), "");
}

TEST_F(MisbehavingProgram, ForgetsAStalledClientThatGoesAway) {
    start({"--fault", "stall.fault"});
    {
        Client client(port);
        client.send(getConfig);
        EXPECT_EQ(line(), "fault: stall case 0");
        EXPECT_EQ(line(), "fault: stalled");
    }
    EXPECT_EQ(line(), "fault: over");
}

TEST_F(MisbehavingProgram, RefusesConnectionsUntilItIsToldToStop) {
    start({"--fault", "refuse.fault"});
    EXPECT_THROW((void)ask(port, getConfig), boost::system::system_error);
    type("fault off");
    EXPECT_EQ(line(), "fault: off");
    EXPECT_THAT(ask(port, getConfig), StartsWith("HTTP/1.1 200 OK\n"));
}

TEST_F(MisbehavingProgram, ChangesNothingWhileAnotherHasItsPort) {
    start({"--fault", "refuse.fault"});
    {
        Program other({"--port", std::to_string(port), "system.xml"});
        EXPECT_THAT(other.readLine(), StartsWith("raidsim: listening"));
        for (const std::string command : {"fault off", "fault cut.fault"}) {
            type(command);
            EXPECT_EQ(program->readErrorLine(), "raidsim: fault: bind: Address already in use");
        }
        other.type("quit\n");
        EXPECT_EQ(other.exitStatus(), 0);
    }
    EXPECT_THROW((void)ask(port, getConfig), boost::system::system_error);
    type("fault off");
    EXPECT_EQ(line(), "fault: off");
    EXPECT_THAT(ask(port, getConfig), StartsWith("HTTP/1.1 200 OK\n"));
}

TEST_F(MisbehavingProgram, SaysWhyACaseCannotBePlayed) {
    start({"--fault", "unfit.fault"});
    EXPECT_EQ(ask(port, getConfig), "");
    EXPECT_EQ(line(), "fault: unfit case 0");
    EXPECT_EQ(line(), "fault: it cannot be played: the answer does not hold \"x<x\"");
    EXPECT_EQ(line(), "fault: over");
}

TEST_F(MisbehavingProgram, IsGoodAgainWhenTheNextCaseHasAMistake) {
    start({"--fault", "mixed.fault"});
    EXPECT_EQ(ask(port, getConfig), "a");
    EXPECT_EQ(program->readErrorLine(),
              "raidsim: fault: mixed case 1 cannot be played: line 5: \"many\" is not a number of "
              "bytes");
    for (int times = 0; times < 2; ++times)
        EXPECT_THAT(ask(port, getConfig), StartsWith("HTTP/1.1 200 OK\n"));
    type("fault mixed.fault");
    EXPECT_EQ(ask(port, getConfig), "a");
}

TEST_F(MisbehavingProgram, RefusesACommandThatNamesNoCase) {
    start({});
    type("fault cut.fault 2");
    EXPECT_EQ(program->readErrorLine(), "raidsim: fault: there are 2 cases, counted from 0");
    type("fault cut.fault first");
    EXPECT_EQ(program->readErrorLine(), "raidsim: fault: \"first\" is not the number of a case");
    type("fault gone.fault");
    EXPECT_EQ(program->readErrorLine(), "raidsim: fault: gone.fault: No such file or directory");
    EXPECT_THAT(ask(port, getConfig), StartsWith("HTTP/1.1 200 OK\n"));
}

}  // namespace
}  // namespace raidsim::test
