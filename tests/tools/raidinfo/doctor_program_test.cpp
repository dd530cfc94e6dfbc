#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <filesystem>
#include <nlohmann/json.hpp>
#include <string>
#include <vector>

#include "documents.h"
#include "program.h"
#include "scripted.h"
#include "support/busy_service.h"
#include "support/files.h"

namespace raidinfo::test {
namespace {

using nlohmann::json;
using raid::test::BusyService;
using raid::test::writeFile;
using testing::AllOf;
using testing::ContainsRegex;
using testing::HasSubstr;

// The doctor only looks whether somebody listens, then it asks.
const Connection probe{.end = End::close};

const Connection sevenIsNewest = answering(newestEventDocument("7"));
const Connection otherPage = answering("<html><body>It works</body></html>");

std::vector<Connection> healthy() {
    return {probe, sevenIsNewest, answering(configuration(sampleAdapter())),
            answering(eventBatch({7}))};
}

// What the JSON says of one check.
json findingOf(const std::string& check, const Result& result) {
    const json document = json::parse(result.output);
    for (const json& finding : document["data"]["findings"]) {
        if (finding["check"] == check) {
            return finding;
        }
    }
    return {};
}

TEST(DoctorCommand, FindsNothingWrong) {
    const ScriptedService service{healthy()};
    const Result result = run({"doctor"});
    EXPECT_EQ(result.errors, "");
    EXPECT_EQ(result.status, 0);
    EXPECT_THAT(result.output,
                AllOf(ContainsRegex("Library +ok +/.*RAIDInstrumentation.*, (32|64) bits"),
                      ContainsRegex("Settings file +ok +/.*/logs/RAIDInstrumentation.ini"),
                      ContainsRegex("Service listens +ok +127.0.0.1 port 34572"),
                      ContainsRegex("Service answers +ok +its newest event is 7"),
                      ContainsRegex("Configuration +ok +well-formed"),
                      ContainsRegex("Lists +ok +1 pellion_adapters, 2 channels"),
                      ContainsRegex("Events +ok +well-formed")));
    EXPECT_THAT(service.request(3), HasSubstr(">7</as:start>"));
}

TEST(DoctorCommand, SaysThatNobodyListens) {
    const Result result = run({"doctor"});
    EXPECT_EQ(result.status, 69);
    EXPECT_THAT(result.output, ContainsRegex("Service listens +bad +nothing on 127.0.0.1 port "
                                             "34572: Connection refused"));
    EXPECT_THAT(result.output, testing::Not(HasSubstr("Service answers")));
}

TEST(DoctorCommand, SaysThatTheServiceGivesNoAnswer) {
    const ScriptedService service{{probe, Connection{}}};
    const Result result = run({"doctor"});
    EXPECT_EQ(result.status, 69);
    EXPECT_THAT(result.output, ContainsRegex("Service answers +bad +it accepts"));
}

TEST(DoctorCommand, GivesUpOnASilentService) {
    const ScriptedService service{{probe, Connection{.end = End::hold}}};
    const Result result = run({"doctor", "--timeout", "1"});
    EXPECT_EQ(result.status, 69);
    EXPECT_THAT(result.output, ContainsRegex("Service answers +bad"));
}

TEST(DoctorCommand, TellsASilentConfigurationFromAMalformedOne) {
    const ScriptedService service{
        {probe, answering(newestEventDocument("7")), Connection{.end = End::hold}}};
    const Result result = run({"doctor", "--timeout", "1", "--json"});
    EXPECT_EQ(result.status, 69);
    const json document = json::parse(result.output);
    EXPECT_EQ(document["complete"], false);
    EXPECT_THAT(document["errors"][0]["message"], HasSubstr("--timeout"));
}

// It has not even come to accept the connection, for others wait before it.
TEST(DoctorCommand, GivesUpOnAServiceThatAcceptsNoConnection) {
    const BusyService service;
    const Result result = run({"doctor", "--timeout", "1"});
    EXPECT_EQ(result.status, 69);
    EXPECT_THAT(result.output, ContainsRegex("Service listens +bad +nothing on 127.0.0.1 port "
                                             "34572: Connection timed out"));
    EXPECT_THAT(result.output, testing::Not(HasSubstr("Service answers")));
}

TEST(DoctorCommand, TellsTheReadersOwnMessageOfAMalformedAnswer) {
    const std::string adapter = complex("adapter", "o:LSIAdapter", simple({{"colour", "red"}}));
    const ScriptedService service{
        {probe, sevenIsNewest, answering(configuration(adapter)), answering(eventBatch({7}))}};
    const Result result = run({"doctor"});
    EXPECT_EQ(result.status, 76);
    EXPECT_THAT(result.output, ContainsRegex("Configuration +bad +XML syntax error: .*colour"));
}

TEST(DoctorCommand, TellsMalformedEventsInTheReadersOwnWords) {
    std::string events = eventBatch({7});
    events.replace(events.find("<as:sequenceNumber"), 0, "<as:colour>red</as:colour>");
    for (const std::string& body : {events, eventBatch({7}).substr(0, 400)}) {
        const ScriptedService service{
            {probe, sevenIsNewest, answering(configuration(sampleAdapter())), answering(body)}};
        const Result result = run({"doctor"});
        EXPECT_EQ(result.status, 76);
        EXPECT_THAT(result.output, AllOf(ContainsRegex("Lists +ok"),
                                         ContainsRegex("Events +bad +XML syntax error: ")));
    }
}

TEST(DoctorCommand, LooksAtEverythingElseOfAServiceWithoutEvents) {
    const ScriptedService service{
        {probe, otherPage, answering(configuration(sampleAdapter())), otherPage}};
    const Result result = run({"doctor"});
    EXPECT_EQ(result.status, 76);
    const std::string said = " +bad +not an answer to the question: it begins with \"<html>";
    EXPECT_THAT(result.output, AllOf(ContainsRegex("Service answers" + said),
                                     ContainsRegex("Lists +ok"), ContainsRegex("Events" + said)));
}

// It asks for the newest number once, so that no event can come between two answers.
TEST(DoctorCommand, TakesAServiceWithoutAnyEventForWell) {
    const ScriptedService service{{probe, answering(newestEventDocument("0")),
                                   answering(configuration(sampleAdapter())),
                                   answering(eventBatch({}))}};
    const Result result = run({"doctor"});
    EXPECT_EQ(result.status, 0);
    EXPECT_THAT(result.output, AllOf(ContainsRegex("Service answers +ok +its newest event is 0"),
                                     ContainsRegex("Events +ok")));
}

TEST(DoctorCommand, FindsANewestNumberBadThatHostsCannotUse) {
    for (const std::string number : {"none", "", "-1"}) {
        const ScriptedService service{{probe, answering(newestEventDocument(number)),
                                       answering(configuration(sampleAdapter())),
                                       answering(eventBatch({}))}};
        const Result result = run({"doctor"});
        EXPECT_EQ(result.status, 76) << number;
        EXPECT_THAT(result.output, ContainsRegex("Service answers +bad +")) << number;
    }
}

TEST(DoctorCommand, SaysThatTheQuestionForEventsGetsNoAnswer) {
    std::vector<Connection> script = healthy();
    script.back() = Connection{};
    const ScriptedService service{script};
    const Result result = run({"doctor"});
    EXPECT_EQ(result.status, 69);
    EXPECT_THAT(result.output, ContainsRegex("Events +bad +it gave no answer"));
}

TEST(DoctorCommand, GivesADroppedConfigurationASecondChance) {
    const ScriptedService service{{probe, sevenIsNewest, Connection{},
                                   answering(configuration(sampleAdapter())),
                                   answering(eventBatch({7}))}};
    const Result result = run({"doctor"});
    EXPECT_EQ(result.status, 0);
    EXPECT_THAT(result.output, AllOf(ContainsRegex("Configuration +ok +well-formed"),
                                     ContainsRegex("Lists +ok +1 pellion_adapters, 2 channels")));
}

TEST(DoctorCommand, TellsTheReadersOwnMessageOfASecondAnswer) {
    const std::string adapter = complex("adapter", "o:LSIAdapter", simple({{"colour", "red"}}));
    const ScriptedService service{{probe, sevenIsNewest, Connection{},
                                   answering(configuration(adapter)), answering(eventBatch({7}))}};
    const Result result = run({"doctor"});
    EXPECT_EQ(result.status, 76);
    EXPECT_THAT(result.output, ContainsRegex("Configuration +bad +XML syntax error: .*colour"));
}

TEST(DoctorCommand, TellsHowThePageOfAnotherServerBegins) {
    const ScriptedService service{
        {probe, sevenIsNewest, otherPage, otherPage, answering(eventBatch({7}))}};
    const Result result = run({"doctor", "--json"});
    EXPECT_EQ(result.status, 76);
    const std::string told =
        "not an answer to the question: it begins with \"<html><body>It works</body></html>\"";
    EXPECT_EQ(findingOf("well_formed", result)["finding"], told);
    EXPECT_EQ(json::parse(result.output)["errors"].size(), 1U);
    EXPECT_EQ(findingOf("events", result)["outcome"], "ok");
}

TEST(DoctorCommand, GoesOnWithoutAPlaceForTheLog) {
    const ScriptedService service{{probe, sevenIsNewest, answering(configuration(sampleAdapter())),
                                   answering(eventBatch({7}).substr(0, 400))}};
    Program doctor{{"/usr/bin/env", "TMPDIR=/nowhere", RAIDINFO_PROGRAM, "doctor"}};
    const Result result = doctor.finish();
    EXPECT_EQ(result.errors, "");
    EXPECT_EQ(result.status, 76);
    EXPECT_THAT(result.output,
                AllOf(ContainsRegex("Configuration +ok"),
                      ContainsRegex("Events +bad +malformed; what the library says of it is not "
                                    "known, for there is no temporary folder: No such file or "
                                    "directory; it begins with \"<.xml")));
}

TEST(DoctorCommand, LeavesNothingBehind) {
    const ScriptedService service{healthy()};
    Program doctor{{"/usr/bin/env", "TMPDIR=.", RAIDINFO_PROGRAM, "doctor"}};
    EXPECT_EQ(doctor.finish().status, 0);
    EXPECT_TRUE(std::filesystem::is_empty(std::filesystem::current_path()));
}

TEST(DoctorCommand, FindsTheSystemWithoutAnAdapterNoteworthy) {
    const ScriptedService service{
        {probe, sevenIsNewest, answering(configuration("")), answering(eventBatch({7}))}};
    const Result result = run({"doctor", "--json"});
    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(findingOf("published", result)["outcome"], "look");
}

// What the doctor says of settings file and log, though no service is there.
class DoctorsHint : public testing::Test {
protected:
    static json of(const std::string& check) { return findingOf(check, run({"doctor", "--json"})); }

    static void expectLook(const std::string& check, const std::string& finding) {
        const json found = of(check);
        EXPECT_EQ(found["outcome"], "look");
        EXPECT_THAT(found["finding"].get<std::string>(), testing::EndsWith(finding));
    }

    static void expectOfSettings(const std::string& text, const std::string& finding) {
        writeFile(raid::test::settingsPath, text);
        expectLook("settings", "/logs/RAIDInstrumentation.ini: " + finding);
    }
};

TEST_F(DoctorsHint, NamesTheLevelOfTheSettingsFile) {
    raid::test::writeLogLevel(8);
    EXPECT_EQ(of("settings")["outcome"], "ok");
    EXPECT_THAT(of("settings")["finding"].get<std::string>(),
                testing::EndsWith("RAIDInstrumentation.ini; log level 8"));
}

TEST_F(DoctorsHint, SaysWhyTheSettingsFileHasNoLevel) {
    expectOfSettings("", "it has no LogLevel; log level 0");
    expectOfSettings("loglevel=8\n", "it has no LogLevel; log level 0");
    expectOfSettings("LogLevel=high\n", "its LogLevel \"high\" is not a number; log level 0");
    expectOfSettings("LogLevel=\n", "its LogLevel \"\" is not a number; log level 0");
    expectOfSettings(std::string(2'000'000, '#'),
                     "it is longer than 1048576 bytes, and is not read; log level 0");
}

TEST_F(DoctorsHint, SaysHowMuchOfALevelCounts) {
    expectOfSettings("LogLevel=8abc\n",
                     "of its LogLevel \"8abc\" only the number that it begins with counts; "
                     "log level 8");
    expectOfSettings("LogLevel=-8.5\n",
                     "of its LogLevel \"-8.5\" only the number that it begins with counts; "
                     "log level -8, which logs nothing, as 0 does");
    expectOfSettings("LogLevel=+-8\n", "its LogLevel \"+-8\" is not a number; log level 0");
    expectOfSettings("LogLevel=+\n", "its LogLevel \"+\" is not a number; log level 0");
}

// The kernel gives some files a page, and then fewer bytes.
TEST_F(DoctorsHint, SaysThatASettingsFileCannotBeReadWhole) {
    std::filesystem::create_symlink("/sys/devices/system/cpu/online", raid::test::settingsPath);
    expectLook("settings", "it cannot be read whole, and is not read; log level 0");
}

TEST_F(DoctorsHint, SaysThatANegativeLevelLogsNothing) {
    raid::test::writeLogLevel(-8);
    expectLook("settings", "RAIDInstrumentation.ini; log level -8, which logs nothing, as 0 does");
    EXPECT_THAT(of("log")["finding"].get<std::string>(), testing::EndsWith(", which is off"));
}

TEST_F(DoctorsHint, SaysThatASettingsFileIsAFolder) {
    std::filesystem::create_directory(raid::test::settingsPath);
    expectLook("settings", "it is not a regular file, and is not read; log level 0");
}

TEST_F(DoctorsHint, SaysThatTheLogIsAFolder) {
    raid::test::writeLogLevel(8);
    std::filesystem::create_directory(raid::test::logPath);
    expectLook("log", "RAIDInstrumentation.log: Is a directory; nothing is logged");
}

}  // namespace
}  // namespace raidinfo::test
