#include "program.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <unistd.h>

#include <csignal>
#include <string>

#include "client.h"
#include "running_service.h"
#include "support/files.h"

namespace raidsim::test {
namespace {

using raid::test::writeFile;
using testing::EndsWith;
using testing::HasSubstr;
using testing::MatchesRegex;
using testing::StartsWith;

constexpr std::string_view readiness = "raidsim: listening on 127.0.0.1:";

std::uint16_t portIn(const std::string& line) {
    EXPECT_THAT(line, StartsWith(std::string(readiness)));
    return static_cast<std::uint16_t>(std::stoi(line.substr(readiness.size())));
}

class RunningProgram : public testing::Test {
protected:
    RunningProgram() { writeFile("system.xml", smallSystem()); }

    // Starts on a free port with more options.
    Program& start(const std::vector<std::string>& options = {}) {
        std::vector<std::string> arguments{"--port", "0", "system.xml"};
        arguments.insert(arguments.begin(), options.begin(), options.end());
        program.emplace(arguments);
        port = portIn(program->readLine());
        return *program;
    }

    std::optional<Program> program;
    std::uint16_t port = 0;
};

TEST_F(RunningProgram, ListensOnTheServicesPortByDefault) {
    Program onDefault({"system.xml"});
    EXPECT_EQ(onDefault.readLine(), "raidsim: listening on 127.0.0.1:34572");
    EXPECT_THAT(ask(34572, getConfig), StartsWith("HTTP/1.1 200 OK\n"));
    onDefault.type("quit\n");
    EXPECT_EQ(onDefault.exitStatus(), 0);
}

TEST_F(RunningProgram, ObeysLinesOnStandardInput) {
    start().type("event type=Critical\nset drive:0 state=4\nstatus\n");
    EXPECT_EQ(program->readLine(), "document system.xml, events 1, newest 1, waiting clients 0");
    EXPECT_THAT(ask(port, getConfig), HasSubstr("<as:state>4</as:state>"));
    EXPECT_THAT(ask(port, getNewestEvent()), HasSubstr(">1</as:return>"));
    program->type("quit\n");
    EXPECT_EQ(program->exitStatus(), 0);
}

TEST_F(RunningProgram, RefusesBadLinesWithOneLineAndGoesOn) {
    start().type("reboot\n");
    EXPECT_EQ(program->readErrorLine(), "raidsim: unknown command \"reboot\"");
    EXPECT_THAT(ask(port, getConfig), StartsWith("HTTP/1.1 200 OK\n"));
}

TEST_F(RunningProgram, GoesOnWhenItsInputEnds) {
    start().type("set system name=elm");
    program->endInput();
    program->signal(SIGHUP);
    EXPECT_EQ(program->readLine(), "serving system.xml");
    EXPECT_THAT(ask(port, getConfig), StartsWith("HTTP/1.1 200 OK\n"));
    program->signal(SIGTERM);
    EXPECT_EQ(program->exitStatus(), 0);
}

TEST_F(RunningProgram, HangupReloadsOrRefusesWithOneLine) {
    start();
    writeFile("system.xml", "<ac:system><as:name>elm</as:name></ac:system>");
    program->signal(SIGHUP);
    EXPECT_EQ(program->readLine(), "serving system.xml");
    EXPECT_THAT(ask(port, getConfig), HasSubstr("<as:name>elm</as:name>"));
    writeFile("system.xml", "<ac:system>");
    program->signal(SIGHUP);
    EXPECT_EQ(program->readErrorLine(),
              "raidsim: reload: system.xml: line 1: element \"ac:system\" is not closed; "
              "the old document stays");
    EXPECT_THAT(ask(port, getConfig), HasSubstr("<as:name>elm</as:name>"));
}

TEST_F(RunningProgram, KeepsThePlaceOfAnInputAndOfErrorsThatAreClosed) {
    writeFile("play.scenario", "at 0 set adapter:9 state=4\nat 0 event type=Critical\n");
    program.emplace(
        std::vector<std::string>{"--port", "0", "--scenario", "play.scenario", "system.xml"},
        Streams{.closed = {STDIN_FILENO, STDERR_FILENO}});
    port = portIn(program->readLine());
    EXPECT_THAT(ask(port, getNewestEvent()), HasSubstr(">1</as:return>"));
    EXPECT_EQ(program->fileOf(STDIN_FILENO), "/dev/null");
    EXPECT_EQ(program->fileOf(STDERR_FILENO), "/dev/null");
    program->signal(SIGTERM);
    EXPECT_EQ(program->exitStatus(), 0);
}

// Nobody has asked for what a running service says.
TEST_F(RunningProgram, GoesOnWithoutAnOutput) {
    const std::vector<std::string> arguments{"--port", "0", "system.xml"};
    for (const Streams& streams :
         {Streams{.closed = {STDOUT_FILENO}}, Streams{.outputFile = "/dev/full"}}) {
        program.emplace(arguments, streams);
        program->type("set system name=elm\nreboot\n");
        EXPECT_EQ(program->readErrorLine(), "raidsim: unknown command \"reboot\"");
        EXPECT_EQ(program->fileOf(STDOUT_FILENO),
                  streams.outputFile == nullptr ? "/dev/null" : streams.outputFile);
        program->type("quit\n");
        EXPECT_EQ(program->exitStatus(), 0);
    }
}

TEST_F(RunningProgram, InterruptEndsItAlthoughAClientWaits) {
    start();
    Client client(port);
    client.send(waitNextEvent(0));
    program->signal(SIGINT);
    EXPECT_EQ(program->exitStatus(), 0);
}

TEST_F(RunningProgram, PlaysTheScenarioAndTellsTheLineOfAFailingStep) {
    writeFile("play.scenario",
              "at 1 event type=Critical\nat 2 set adapter:9 state=4\nat 3 event type=Warning\n");
    start({"--scenario", "play.scenario", "--speed", "100000"});
    EXPECT_EQ(program->readErrorLine(),
              "raidsim: play.scenario: line 2: set: the document has no adapter:9");
    EXPECT_THAT(ask(port, waitNextEvent(1)), HasSubstr(">2</as:return>"));
}

TEST_F(RunningProgram, RunsTheInitFileBeforeItListens) {
    writeFile("before.init", "event type=Information\nevent type=Information\n");
    start({"--init", "before.init"});
    EXPECT_THAT(ask(port, getNewestEvent()), HasSubstr(">2</as:return>"));
}

TEST_F(RunningProgram, PortInUseIsOneLineAndAStatus) {
    const std::string taken = (start(), std::to_string(port));
    Program second({"--port", taken, "system.xml"});
    EXPECT_EQ(second.readErrors(),
              "raidsim: cannot listen on 127.0.0.1:" + taken + ": Address already in use\n");
    EXPECT_EQ(second.exitStatus(), 69);
}

struct FailingStart {
    std::vector<std::string> arguments;
    const char* message;
    int status;
};

const std::vector<FailingStart> failingStarts{
    {{"gone.xml"}, "raidsim: gone.xml: No such file or directory\n", 66},
    {{"."}, "raidsim: .: Not a regular file\n", 66},
    {{"open.xml"}, "raidsim: open.xml: line 1: element \"ac:system\" is not closed\n", 65},
    {{"--scenario", "gone", "system.xml"}, "raidsim: gone: No such file or directory\n", 66},
    {{"--scenario", "bad.script", "system.xml"},
     "raidsim: bad.script: line 1: unknown statement \"status\"; [^\n]*\n",
     65},
    {{"--scenario", "no-config.scenario"},
     "raidsim: no-config.scenario names no configuration, so CONFIG is required\n",
     64},
    {{"--scenario", "gone-config.scenario"}, "raidsim: gone.xml: No such file or directory\n", 66},
    {{"--replay", "gone.rec"}, "raidsim: gone.rec: No such file or directory\n", 66},
    {{"--replay", "system.xml"},
     "raidsim: system.xml: byte 0: a recording begins with a line such as [^\n]*\n",
     65},
    {{"--init", "bad.script", "system.xml"},
     "raidsim: bad.script: line 2: unknown command \"reboot\"\n",
     65},
    {{"--init", "failing.init", "system.xml"},
     "raidsim: failing.init: line 1: set: the document has no adapter:9\n",
     65},
    {{"--fault", "gone.fault", "system.xml"},
     "raidsim: gone.fault: No such file or directory\n",
     66},
    {{"--fault", "bad.fault", "system.xml"},
     "raidsim: bad.fault: line 2: unknown instruction \"explode\"\n",
     65},
    {{"no-config.scenario"},
     "raidsim: no-config.scenario: line 1: [^\n]*; this looks like a scenario: use --scenario\n",
     65},
    {{"bad.fault"}, "raidsim: bad.fault: [^\n]*; this looks like a fault file: use --fault\n", 65},
    {{"failing.init"},
     "raidsim: failing.init: [^\n]*; this looks like a file of commands: use --init\n",
     65},
    {{"day.rec"}, "raidsim: day.rec: [^\n]*; this looks like a recording: use --replay\n", 65},
    {{"--scenario", "system.xml"},
     "raidsim: system.xml: [^\n]*; this looks like a configuration: give it as CONFIG\n",
     65}};

TEST(Program, FailsToStartWithOneLineAndAStatus) {
    writeFile("system.xml", smallSystem());
    writeFile("open.xml", "<ac:system>");
    writeFile("bad.script", "status\nreboot\n");
    writeFile("bad.fault", "title \"Bad\"\nexplode\n");
    writeFile("no-config.scenario", "at 1 status\n");
    writeFile("gone-config.scenario", "config gone.xml\n");
    writeFile("day.rec", "raid-recording 1 2026-11-21T17:48:00Z\n");
    writeFile("failing.init", "set adapter:9 state=4\n");
    for (const auto& [arguments, message, status] : failingStarts) {
        Program program(arguments);
        EXPECT_THAT(program.readErrors(), MatchesRegex(message));
        EXPECT_EQ(program.exitStatus(), status) << message;
    }
}

TEST(Program, KeepsBeginningAndEndOfAComplaintAboutAVeryLongWord) {
    writeFile("one-line.scenario", "at 1 " + std::string(3'000'000, 'x') + "\n");
    Program program({"--scenario", "one-line.scenario", "system.xml"});
    const std::string complaint = program.readErrors();
    EXPECT_THAT(complaint, StartsWith("raidsim: one-line.scenario: line 1: unknown command \"xxx"));
    EXPECT_THAT(complaint, HasSubstr("x...x"));
    EXPECT_THAT(complaint, EndsWith("x\"\n"));
    EXPECT_LT(complaint.size(), 1500U);
    EXPECT_EQ(program.exitStatus(), 65);
}

struct WrongCommandLine {
    std::vector<std::string> arguments;
    const char* complaint;
};

const std::vector<WrongCommandLine> wrongCommandLines{
    {{}, "CONFIG is required"},
    {{""}, "CONFIG: \"\" is no name of a file"},
    {{"a.xml", "b.xml"}, "one word too many, \"b.xml\" (see raidsim --help)"},
    {{"--", "a.xml", "b.xml"}, "one word too many, \"b.xml\" (see raidsim --help)"},
    {{"--color", "a.xml"}, "unknown option \"--color\" (see raidsim --help)"},
    {{"--port", "70000", "a.xml"}, "--port: \"70000\" is no number from 0 to 65535"},
    {{"--port", "1", "--port", "2", "a.xml"}, "--port is given more than once"},
    {{"--speed", "0", "a.xml"}, "--speed: \"0\" is no number from 0.001 to 1000000"},
    {{"--speed", "nan", "a.xml"}, "--speed: \"nan\" is no number from 0.001 to 1000000"},
    {{"--clock", "x", "a.xml"}, "--clock: \"x\" is neither real nor virtual"},
    {{"--seed", "-1", "a.xml"}, "--seed: \"-1\" is no number from 0 to 18446744073709551615"},
    {{"--epoch", "yesterday", "a.xml"},
     "--epoch: \"yesterday\" is no time such as 2026-11-21T17:48:00Z"},
    {{"--epoch", "a\nb", "a.xml"}, "--epoch: \"a?b\" is no time such as 2026-11-21T17:48:00Z"},
    {{"a.xml", "--fault"}, "--fault needs a value"},
    {{"--fault", "--port", "0", "a.xml"}, "--fault: \"--port\" is no name of a file"},
    {{"--scenario", ""}, "--scenario: \"\" is no name of a file"},
    {{"--replay", "a.rec", "a.xml"},
     "--replay serves a recording in place of CONFIG; both are given"},
    {{"--epoch", "2026-01-01T00:00:00Z", "a.xml"}, "--epoch needs --clock virtual"},
    {{"--clock", "virtual", "--speed", "1", "a.xml"}, "--speed needs --clock real"},
    {{"--speed", "2", "a.xml"}, "--speed needs --scenario or --replay"},
    {{"--seed", "2", "a.xml"}, "--seed needs --scenario"},
    {{"--seed", "2", "--replay", "a.rec"}, "--seed needs --scenario"},
    {{"generate", "--adapters", "1000", "--drives", "1000"},
     "a rack has 50000 adapters, channels and drives at most"},
    {{"generate", "--adapters", "50001", "--channels", "0"},
     "a rack has 50000 adapters, channels and drives at most"},
    {{"generate", "--events", "3", "--drives", "3"},
     "--events writes no rack, so --drives does not go with it"},
    {{"generate", "--adapters", "-1"}, "--adapters: \"-1\" is no number from 0 to 100000"},
    {{"generate", "--shuffle", "4294967296"},
     "--shuffle: \"4294967296\" is no number from 0 to 4294967295"},
    {{"generate", "--port", "0"}, "unknown option \"--port\" (see raidsim --help)"},
    {{"generate", "completion"}, "one word too many, \"completion\" (see raidsim --help)"},
    {{"--port", "0", "generate"}, "--port does not go with generate"},
    {{"a.xml", "completion"}, "CONFIG does not go with completion"},
};

TEST(Program, SaysInOneLineWhatIsWrongWithTheCommandLine) {
    for (const auto& [arguments, complaint] : wrongCommandLines) {
        Program program(arguments);
        EXPECT_EQ(program.readErrors(), std::string("raidsim: ") + complaint + "\n");
        EXPECT_EQ(program.exitStatus(), 64) << complaint;
    }
}

TEST(Program, WritesAGeneratedDocumentAndEnds) {
    Program program({"generate", "--adapters", "0", "--compact"});
    EXPECT_THAT(program.readOutput(), MatchesRegex("<\\?xml [^\n]*</env:Envelope>"));
    EXPECT_EQ(program.exitStatus(), 0);
}

TEST(Program, SaysSoWhenItsOutputCannotBeWritten) {
    for (const char* const word : {"generate", "completion", "--help"}) {
        for (const Streams& streams :
             {Streams{.outputFile = "/dev/full"}, Streams{.closed = {STDOUT_FILENO}}}) {
            Program program({word}, streams);
            EXPECT_EQ(program.readErrors(), "raidsim: cannot write the output\n");
            EXPECT_EQ(program.exitStatus(), 74);
        }
    }
}

TEST(Program, TellsItsVersion) {
    Program program({"--version"});
    EXPECT_EQ(program.readOutput(), "raidsim " RAIDSIM_VERSION "\n");
    EXPECT_EQ(program.exitStatus(), 0);
}

TEST(Program, HelpNamesEveryOption) {
    Program program({"--help"});
    const std::string help = program.readOutput();
    for (const char* const option :
         {"CONFIG", "--replay", "--init", "--scenario", "--fault", "--clock", "--epoch", "--speed",
          "--seed", "--port", "--version", "generate", "completion", "Examples:", "Exit status:"})
        EXPECT_THAT(help, HasSubstr(option));
    EXPECT_EQ(program.exitStatus(), 0);
}

TEST(Program, HelpCallsValuesByTheirMeaning) {
    const std::string help = Program({"--help"}).readOutput();
    for (const char* const words :
         {" CONFIG FILE ", " --scenario FILE ", " --clock real|virtual ", " --epoch DATE ",
          " --speed FACTOR=1 ", " --seed NUMBER ", " --port NUMBER=34572 "})
        EXPECT_THAT(help, HasSubstr(words));
    const std::string ofGenerate = Program({"generate", "--help"}).readOutput();
    for (const char* const words :
         {" --drives NUMBER=12 ", " --events NUMBER ", " --shuffle SEED ", "\nExamples:\n"})
        EXPECT_THAT(ofGenerate, HasSubstr(words));
}

}  // namespace
}  // namespace raidsim::test
