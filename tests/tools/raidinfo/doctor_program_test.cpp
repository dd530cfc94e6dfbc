#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <filesystem>
#include <nlohmann/json.hpp>

#include "documents.h"
#include "program.h"
#include "scripted.h"
#include "support/busy_service.h"

namespace raidinfo::test {
namespace {

using nlohmann::json;
using raid::test::BusyService;
using testing::AllOf;
using testing::ContainsRegex;
using testing::HasSubstr;

// The doctor only looks whether somebody listens, then it asks.
const Connection probe{.end = End::close};

TEST(DoctorCommand, FindsNothingWrong) {
    const ScriptedService service{
        {probe, answering(newestEventDocument("7")), answering(configuration(sampleAdapter()))}};
    const Result result = run({"doctor"});
    EXPECT_EQ(result.errors, "");
    EXPECT_EQ(result.status, 0);
    EXPECT_THAT(result.output,
                AllOf(ContainsRegex("Library +ok +/.*RAIDInstrumentation.*, (32|64) bits"),
                      ContainsRegex("Settings file +ok +/.*/logs/RAIDInstrumentation.ini"),
                      ContainsRegex("Service listens +ok +127.0.0.1 port 34572"),
                      ContainsRegex("Service answers +ok +its newest event is 7"),
                      ContainsRegex("Configuration +ok +well-formed"),
                      ContainsRegex("Lists +ok +1 pellion_adapters, 2 channels")));
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
        {probe, answering(newestEventDocument("7")), answering(configuration(adapter))}};
    const Result result = run({"doctor"});
    EXPECT_EQ(result.status, 76);
    EXPECT_THAT(result.output, ContainsRegex("Configuration +bad +XML syntax error: .*colour"));
}

TEST(DoctorCommand, LeavesNothingBehind) {
    const ScriptedService service{
        {probe, answering(newestEventDocument("7")), answering(configuration(sampleAdapter()))}};
    Program doctor{{"/usr/bin/env", "TMPDIR=.", RAIDINFO_PROGRAM, "doctor"}};
    EXPECT_EQ(doctor.finish().status, 0);
    EXPECT_TRUE(std::filesystem::is_empty(std::filesystem::current_path()));
}

TEST(DoctorCommand, FindsTheSystemWithoutAnAdapterNoteworthy) {
    const ScriptedService service{
        {probe, answering(newestEventDocument("7")), answering(configuration(""))}};
    const json document = json::parse(run({"doctor", "--json"}).output);
    const json last = document["data"]["findings"].back();
    EXPECT_EQ(last["check"], "published");
    EXPECT_EQ(last["outcome"], "look");
}

}  // namespace
}  // namespace raidinfo::test
