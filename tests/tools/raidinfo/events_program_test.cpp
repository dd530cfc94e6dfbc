#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <csignal>
#include <cstdio>
#include <fstream>
#include <nlohmann/json.hpp>
#include <sstream>

#include "documents.h"
#include "program.h"
#include "scripted.h"
#include "simulator.h"

namespace raidinfo::test {
namespace {

using nlohmann::json;
using raid::test::Gate;
using testing::ElementsAre;
using testing::HasSubstr;

const Connection failing{};
const Connection waiting{.end = End::hold};

Connection newest(int number) { return answering(newestEventDocument(std::to_string(number))); }

Connection awaited() { return answering("the answer to the wait is not looked at"); }

std::vector<int> numbers(const std::string& output) {
    std::vector<int> result;
    std::istringstream lines{output};
    for (std::string line; std::getline(lines, line);) {
        const json data = json::parse(line).at("data");
        if (data.is_object()) {
            result.push_back(data.at("sequence_number"));
        }
    }
    return result;
}

// Interrupts the program once it waits on this connection.
Result interrupt(Program& program, const ScriptedService& service, std::size_t connection) {
    service.waitFor(connection, Stage::answered);
    program.signal(SIGINT);
    return program.finish();
}

TEST(EventsCommand, ShowsEventsFromTheNewestOnUntilInterrupted) {
    const ScriptedService service{{newest(41), awaited(), answering(eventBatch({41})), newest(41),
                                   awaited(), awaited(), answering(eventBatch({41, 42, 43})),
                                   newest(43), waiting}};
    Program program{raidinfo({"events"})};
    const Result result = interrupt(program, service, 8);
    const std::string tail =
        "  (code 0, adapter 0, channel 1, device 3, enclosure 0, logical drive 0, "
        "server -, address -)\n";
    EXPECT_EQ(result.output, "41  2006-10-02  Warning  event 41" + tail +
                                 "42  2006-10-02  Warning  event 42" + tail +
                                 "43  2006-10-02  Warning  event 43" + tail);
    EXPECT_EQ(result.errors, "");
    EXPECT_EQ(result.status, 130);
    EXPECT_THAT(service.request(4), HasSubstr(">41</as:lastRetrieved>"));
    EXPECT_THAT(service.request(6), HasSubstr(">41</as:start>"));
    EXPECT_THAT(service.request(8), HasSubstr(">43</as:lastRetrieved>"));
}

TEST(EventsCommand, WritesOneJsonDocumentPerLine) {
    const ScriptedService service{
        {newest(7), awaited(), answering(eventBatch({7, 8})), newest(8), waiting}};
    Program program{raidinfo({"events", "--json"})};
    const Result result = interrupt(program, service, 4);
    EXPECT_THAT(numbers(result.output), ElementsAre(7, 8));
}

TEST(EventsCommand, WritesEventsAsSoonAsTheyCome) {
    const ScriptedService service{
        {newest(7), awaited(), answering(eventBatch({7})), newest(7), waiting}};
    Program program{raidinfo({"events", "--json"})};
    EXPECT_THAT(numbers(program.waitForOutput("\n")), ElementsAre(7));
    EXPECT_EQ(interrupt(program, service, 4).status, 130);
}

TEST(EventsCommand, EndsWhenItIsInterruptedInAWait) {
    const ScriptedService service{{newest(7), waiting}};
    Program program{raidinfo({"events"})};
    service.waitFor(1, Stage::answered);
    program.signal(SIGTERM);
    EXPECT_EQ(program.finish().status, 143);
}

TEST(EventsCommand, ShowsNothingTwiceWhenAWaitFails) {
    // The failed wait publishes 41 and 42 again and advances the library's number to 45.
    const ScriptedService service{{newest(41), awaited(), answering(eventBatch({41, 42})),
                                   newest(42), failing, failing, newest(44), awaited(),
                                   answering(eventBatch({42, 43, 44, 44})), newest(44), waiting}};
    Program program{raidinfo({"events", "--json"})};
    const Result result = interrupt(program, service, 10);
    EXPECT_THAT(numbers(result.output), ElementsAre(41, 42, 43, 44));
    EXPECT_THAT(service.request(8), HasSubstr(">42</as:start>"));
    EXPECT_THAT(service.request(10), HasSubstr(">44</as:lastRetrieved>"));
}

TEST(EventsCommand, GoesOnAfterAnEmptyBatchAndAMalformedOne) {
    const ScriptedService service{{newest(3), awaited(), answering(eventBatch({})), newest(3),
                                   awaited(), answering("<"), newest(3), awaited(),
                                   answering(eventBatch({3, 4})), newest(4), waiting}};
    Program program{raidinfo({"events", "--json"})};
    EXPECT_THAT(numbers(interrupt(program, service, 10).output), ElementsAre(3, 4));
}

TEST(EventsCommand, WaitsForAServiceThatGoesAwayAndSaysSoOnce) {
    const ScriptedService service{{newest(41), awaited(), answering(eventBatch({41})), failing,
                                   failing, newest(41), awaited(), answering(eventBatch({42})),
                                   newest(42), waiting}};
    Program program{raidinfo({"events"})};
    const Result result = interrupt(program, service, 9);
    EXPECT_EQ(result.errors,
              "raidinfo: the RAID management service does not answer; waiting for it\n"
              "raidinfo: the RAID management service answers again\n");
    EXPECT_EQ(std::ranges::count(result.output, '\n'), 2);
    EXPECT_EQ(result.status, 130);
}

TEST(EventsCommand, TellsProgramsWhatItTellsPeople) {
    const ScriptedService service{
        {newest(1), awaited(), answering(eventBatch({1, 4})), failing, newest(4), waiting}};
    Program program{raidinfo({"events", "--json"})};
    const Result result = interrupt(program, service, 5);
    std::vector<std::string> codes;
    std::istringstream lines{result.output};
    for (std::string line; std::getline(lines, line);) {
        const json document = json::parse(line);
        EXPECT_EQ(document["complete"], document["errors"].empty());
        for (const json& error : document["errors"]) {
            codes.push_back(error["code"]);
        }
    }
    EXPECT_THAT(codes, ElementsAre("events_missing", "service_unavailable", "service_available"));
    EXPECT_THAT(result.errors, HasSubstr("events 2 to 3 are missing"));
}

TEST(EventsCommand, ShowsWhatComesAfterTheServiceHasBegunToCountAnew) {
    const ScriptedService service{{newest(41), awaited(), answering(eventBatch({41})), newest(2),
                                   awaited(), answering(eventBatch({2})), newest(2), awaited(),
                                   answering(eventBatch({1, 2})), newest(2), waiting}};
    Program program{raidinfo({"events", "--json"})};
    const Result result = interrupt(program, service, 10);
    EXPECT_THAT(numbers(result.output), ElementsAre(41, 1, 2));
    EXPECT_THAT(result.errors, HasSubstr("begun to count anew"));
    EXPECT_THAT(service.request(5), HasSubstr(">2</as:start>"));
    EXPECT_THAT(service.request(8), HasSubstr(">0</as:start>"));
}

TEST(EventsCommand, NoticesThatTheServiceCountsAnewAlsoWhenItHasCaughtUp) {
    const ScriptedService service{{newest(2), awaited(), answering(eventBatch({2})), newest(4),
                                   awaited(), answering(otherEventBatch({2, 3, 4})), newest(4),
                                   awaited(), answering(otherEventBatch({1, 2, 3, 4})), newest(4),
                                   waiting}};
    Program program{raidinfo({"events", "--json"})};
    const Result result = interrupt(program, service, 10);
    EXPECT_THAT(numbers(result.output), ElementsAre(2, 1, 2, 3, 4));
    EXPECT_THAT(result.errors, HasSubstr("begun to count anew"));
}

TEST(EventsCommand, TakesNoDisorderForANewCount) {
    const ScriptedService service{{newest(6), awaited(), answering(eventBatch({6})), newest(4),
                                   awaited(), answering(eventBatch({6, 5, 4})), newest(4),
                                   waiting}};
    Program program{raidinfo({"events", "--json"})};
    const Result result = interrupt(program, service, 7);
    EXPECT_THAT(numbers(result.output), ElementsAre(6));
    EXPECT_EQ(result.errors, "");
    EXPECT_THAT(service.request(7), HasSubstr(">6</as:lastRetrieved>"));
}

TEST(EventsCommand, ShowsAnEventThatComesLate) {
    const ScriptedService service{{newest(5), awaited(), answering(eventBatch({5})), newest(5),
                                   awaited(), awaited(), answering(eventBatch({7})), newest(7),
                                   awaited(), answering(eventBatch({6, 7})), newest(7), waiting}};
    Program program{raidinfo({"events", "--json"})};
    const Result result = interrupt(program, service, 11);
    EXPECT_THAT(numbers(result.output), ElementsAre(5, 7, 6));
    EXPECT_THAT(service.request(9), HasSubstr(">6</as:start>"));
}

TEST(EventsCommand, HandsNothingOutWhenItCannotKeepAccount) {
    const Result result = run({"events", "--state", "nowhere/state", "--exec", "touch hook.ran"});
    EXPECT_EQ(result.status, 73);
    EXPECT_EQ(result.output, "");
    EXPECT_FALSE(std::ifstream{"hook.ran"}.good());
}

TEST(EventsCommand, PassesOverNumbersThatTheServiceNoLongerHas) {
    const Connection nothing = answering(eventBatch({}));
    const Connection last = answering(eventBatch({299, 300}));
    // When they have come, those that went missing last are looked for once more.
    const ScriptedService service{{newest(300), awaited(), nothing, last, newest(300), awaited(),
                                   last, newest(300), awaited(), last, newest(300), waiting}};
    Program program{raidinfo({"events", "--json", "--since", "1"})};
    const Result result = interrupt(program, service, 11);
    EXPECT_THAT(numbers(result.output), ElementsAre(299, 300));
    EXPECT_THAT(service.request(3), HasSubstr(">1</as:start><as:end xsi:type=\"xsd:int\">300</"));
    EXPECT_THAT(service.request(6), HasSubstr(">299</as:start>"));
    EXPECT_THAT(service.request(9), HasSubstr(">201</as:start>"));
    EXPECT_THAT(result.errors, HasSubstr("events 1 to 298 are missing"));
}

TEST(EventsCommand, EndsAfterAsManyEventsAsWereAskedFor) {
    const ScriptedService service{{newest(9), awaited(), answering(eventBatch({5, 6, 7}))}};
    const Result result = run({"events", "--json", "--since", "5", "--count", "2"});
    EXPECT_THAT(numbers(result.output), ElementsAre(5, 6));
    EXPECT_EQ(result.status, 0);
    EXPECT_THAT(service.request(2), HasSubstr(">5</as:start>"));
}

TEST(EventsCommand, BeginsWithTheOldestEventWhateverItsNumber) {
    Simulator simulator{"small-server.xml"};
    simulator.command("event sequenceNumber=500 string=oldest\nevent string=second");
    const Result result = run({"events", "--json", "--since", "0", "--count", "2"});
    EXPECT_THAT(numbers(result.output), ElementsAre(500, 501));
    EXPECT_EQ(result.errors, "");
}

// It counts anew and has come as far, before anybody has noticed that it was away.
TEST(EventsCommand, NoticesAServiceThatWasRestartedQuickly) {
    const ScriptedService service{{newest(3), awaited(), answering(eventBatch({1, 2, 3})),
                                   newest(3), failing, failing, newest(3), awaited(),
                                   answering(otherEventBatch({3})), newest(3), awaited(),
                                   answering(otherEventBatch({1, 2, 3})), newest(3), waiting}};
    Program program{raidinfo({"events", "--json", "--since", "1"})};
    const Result result = interrupt(program, service, 13);
    EXPECT_THAT(numbers(result.output), ElementsAre(1, 2, 3, 1, 2, 3));
    EXPECT_THAT(result.errors, HasSubstr("it has begun to count anew"));
}

// The read behind the last event shown holds nothing but that, and the next one a hundred further.
TEST(EventsCommand, PassesOverAGapThatIsLongerThanWhatIsAskedForAtOnce) {
    Simulator simulator{"small-server.xml"};
    for (int number = 1; number <= 5; ++number) {
        simulator.command("event string=early");
    }
    simulator.command("event sequenceNumber=300");
    simulator.command("event sequenceNumber=500");
    const Result result = run({"events", "--json", "--since", "1", "--count", "7"});
    EXPECT_THAT(numbers(result.output), ElementsAre(1, 2, 3, 4, 5, 300, 500));
    EXPECT_EQ(result.errors,
              "raidinfo: events 6 to 299 are missing\nraidinfo: events 301 to 499 are missing\n");
}

TEST(EventsCommand, FindsTheEventBehindAGapOfAnyLength) {
    Simulator simulator{"small-server.xml"};
    simulator.obey("event sequenceNumber=5");
    simulator.command("event sequenceNumber=10000000\nevent sequenceNumber=2147483600");
    const Result result = run({"events", "--json", "--since", "0", "--count", "4"});
    EXPECT_THAT(numbers(result.output), ElementsAre(5, 1000, 10'000'000, 2'147'483'600));
    EXPECT_EQ(result.errors,
              "raidinfo: events 6 to 999 are missing\n"
              "raidinfo: events 1001 to 9999999 are missing\n"
              "raidinfo: events 10000001 to 2147483599 are missing\n");
}

TEST(EventsCommand, WalksOnWhereTheServiceDoesNotAnswerTheSearchForTheNextEvent) {
    const ScriptedService service{{newest(150), awaited(), answering(eventBatch({})), failing,
                                   newest(150), awaited(), answering(eventBatch({150}))}};
    const Result result = run({"events", "--json", "--since", "1", "--count", "1"});
    EXPECT_THAT(numbers(result.output), ElementsAre(150));
    EXPECT_THAT(service.request(6), HasSubstr(">102</as:start>"));
}

// What comes late has a number a little below the newest one.
TEST(EventsCommand, AsksForWhatIsBelowANewestNumberWithoutAnEvent) {
    const Connection nothing = answering(eventBatch({}));
    const ScriptedService service{{newest(700), awaited(), nothing, nothing, newest(700), awaited(),
                                   answering(eventBatch({650}))}};
    const Result result = run({"events", "--json", "--since", "1", "--count", "1"});
    EXPECT_THAT(numbers(result.output), ElementsAre(650));
    EXPECT_THAT(service.request(6), HasSubstr(">600</as:start>"));
}

TEST(EventsCommand, AsksForNothingTwiceBehindANewestNumberWithoutAnEvent) {
    const Connection last = answering(eventBatch({60}));
    const ScriptedService service{{newest(60), awaited(), answering(eventBatch({10, 60})),
                                   newest(115), awaited(), last, answering(eventBatch({})),
                                   newest(115), awaited(), answering(eventBatch({115}))}};
    const Result result = run({"events", "--json", "--since", "10", "--count", "3"});
    EXPECT_THAT(numbers(result.output), ElementsAre(10, 60, 115));
    EXPECT_THAT(service.request(5), HasSubstr(">11</as:start>"));
    EXPECT_THAT(service.request(6), HasSubstr(">61</as:start><as:end xsi:type=\"xsd:int\">115</"));
    EXPECT_THAT(service.request(9), HasSubstr(">62</as:start>"));
}

TEST(EventsCommand, ShowsAnotherEventThatUsesTheLastNumberWhileItWaits) {
    Simulator simulator{"small-server.xml"};
    simulator.command("event sequenceNumber=45 string=one");
    Program program{raidinfo({"events", "--json", "--since", "45", "--count", "3"})};
    program.waitForOutput("\n");
    simulator.command("event place=last sequenceNumber=45 string=another");
    simulator.command("event sequenceNumber=46");
    EXPECT_THAT(numbers(program.finish().output), ElementsAre(45, 45, 46));
}

TEST(EventsCommand, NoticesInTheMidstOfAWaitThatTheNumbersRepeatOrGoBack) {
    Simulator simulator{"small-server.xml"};
    simulator.command("event sequenceNumber=1000");
    Program program{raidinfo({"events", "--json", "--since", "1000", "--interval", "1"})};
    program.waitForOutput("\n");
    simulator.command("event place=last sequenceNumber=1000 string=another");
    program.waitForOutput("another");
    simulator.command("event place=last sequenceNumber=50 string=lower");
    EXPECT_THAT(numbers(program.waitForOutput("lower")), ElementsAre(1000, 1000, 50));
    program.signal(SIGINT);
    EXPECT_THAT(program.finish().errors, HasSubstr("begun to count anew"));
}

TEST(EventsCommand, TellsAGapBeforeTheEventBehindIt) {
    const ScriptedService service{{newest(9), awaited(), answering(eventBatch({5, 7, 9}))}};
    const Result result = run({"events", "--json", "--since", "5", "--count", "2"});
    EXPECT_THAT(numbers(result.output), ElementsAre(5, 7));
    EXPECT_EQ(result.errors, "raidinfo: event 6 is missing\n") << "nobody has come to event 8";
}

TEST(EventsCommand, SaysThatItWaitsForAnEventThatIsNotThereYet) {
    const ScriptedService service{{newest(3), awaited(), answering(eventBatch({8}))}};
    const Result result = run({"events", "--json", "--since", "8", "--count", "1"});
    EXPECT_THAT(numbers(result.output), ElementsAre(8));
    EXPECT_EQ(result.errors, "raidinfo: the newest event is 3; waiting for event 8\n");
}

TEST(EventsCommand, GoesOnWhereItEndedTheLastTime) {
    const ScriptedService service{{newest(9), awaited(), answering(eventBatch({5, 6})), newest(9),
                                   awaited(), answering(eventBatch({6, 7, 8}))}};
    static_cast<void>(
        run({"events", "--json", "--since", "5", "--count", "1", "--state", "events.state"}));
    const Result result = run({"events", "--json", "--count", "2", "--state", "events.state"});
    EXPECT_THAT(numbers(result.output), ElementsAre(6, 7));
    EXPECT_THAT(service.request(5), HasSubstr(">5</as:start>"));
    std::remove("events.state");
}

TEST(EventsCommand, LosesNothingBetweenARunThatSawNoEventAndTheNext) {
    const ScriptedService service{
        {newest(0), waiting, newest(3), awaited(), answering(eventBatch({1, 2, 3}))}};
    Program first{raidinfo({"events", "--state", "events.state"})};
    EXPECT_EQ(interrupt(first, service, 1).output, "");
    const Result result = run({"events", "--json", "--count", "3", "--state", "events.state"});
    EXPECT_THAT(numbers(result.output), ElementsAre(1, 2, 3));
    EXPECT_EQ(result.errors, "");
    std::remove("events.state");
}

TEST(EventsCommand, GivesUpOnAServiceThatIsSilentFromTheStart) {
    const ScriptedService service{{waiting}};
    const Result result = run({"events", "--timeout", "1"});
    EXPECT_EQ(result.status, 69);
    EXPECT_THAT(result.errors, HasSubstr("--timeout"));
}

// Some supervisors leave the signal ignored, and children inherit that.
TEST(EventsCommand, LearnsThatTheProgramFailedAlsoWhereTheEndOfChildrenIsIgnored) {
    const ScriptedService service{{newest(5), awaited(), answering(eventBatch({5}))}};
    Program program{{"/bin/sh", "-c", "trap '' CHLD; exec \"$0\" events --count 1 --exec 'exit 3'",
                     RAIDINFO_PROGRAM}};
    EXPECT_THAT(program.finish().errors, HasSubstr("ended with status 3"));
}

// What the program writes would otherwise go into one of raidinfo's own files.
TEST(EventsCommand, RunsAProgramAlsoWithoutAStandardError) {
    const ScriptedService service{{newest(5), awaited(), answering(eventBatch({5}))}};
    Program program{{"/bin/sh", "-c",
                     "exec \"$0\" events --json --count 1 --exec 'echo written || exit 3' 2>&-",
                     RAIDINFO_PROGRAM}};
    const Result result = program.finish();
    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(json::parse(result.output)["errors"], json::array());
}

TEST(EventsCommand, HandsEachEventToAProgram) {
    const ScriptedService service{{newest(5), awaited(), answering(eventBatch({5, 6}))}};
    const Result result = run({"events", "--count", "2", "--exec", "cat >>hook.out"});
    EXPECT_EQ(result.status, 0);
    std::ostringstream given;
    given << std::ifstream{"hook.out"}.rdbuf();
    EXPECT_THAT(numbers(given.str()), ElementsAre(5, 6));
    std::remove("hook.out");
}

TEST(EventsCommand, SaysThatTheProgramFailedAndGoesOn) {
    const ScriptedService service{{newest(5), awaited(), answering(eventBatch({5, 6}))}};
    const Result result = run({"events", "--count", "2", "--exec", "exit 3"});
    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(std::ranges::count(result.output, '\n'), 2);
    EXPECT_EQ(result.errors,
              "raidinfo: the command for the event ended with status 3\n"
              "raidinfo: the command for the event ended with status 3\n");
}

TEST(EventsCommand, FollowsFromTheLargestNumberThereIs) {
    const int largest = 2147483647;
    const ScriptedService service{
        {newest(largest), awaited(), answering(eventBatch({largest})), newest(largest), waiting}};
    Program program{raidinfo({"events", "--json"})};
    EXPECT_THAT(numbers(interrupt(program, service, 4).output), ElementsAre(largest));
}

}  // namespace
}  // namespace raidinfo::test
