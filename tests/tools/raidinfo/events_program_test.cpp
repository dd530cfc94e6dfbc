#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <chrono>
#include <csignal>
#include <nlohmann/json.hpp>
#include <sstream>

#include "documents.h"
#include "program.h"
#include "support/scripted_service.h"

namespace raidinfo::test {
namespace {

using nlohmann::json;
using raid::test::answering;
using raid::test::Connection;
using raid::test::End;
using raid::test::Gate;
using raid::test::newestEventDocument;
using raid::test::ScriptedService;
using raid::test::Stage;
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
        result.push_back(json::parse(line).at("sequence_number"));
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
    const ScriptedService service{{newest(41), awaited(), answering(eventBatch({41})), awaited(),
                                   answering(eventBatch({42, 43})), waiting}};
    Program program{raidinfo({"events"})};
    const Result result = interrupt(program, service, 5);
    const std::string tail =
        "  (code 0, adapter 0, channel 1, device 3, enclosure 0, logical drive 0, "
        "server -, address -)\n";
    EXPECT_EQ(result.output, "41  2006-10-02  Warning  event 41" + tail +
                                 "42  2006-10-02  Warning  event 42" + tail +
                                 "43  2006-10-02  Warning  event 43" + tail);
    EXPECT_EQ(result.errors, "");
    EXPECT_EQ(result.status, 130);
    EXPECT_THAT(service.request(5), HasSubstr(">43</as:lastRetrieved>"));
}

TEST(EventsCommand, WritesOneJsonDocumentPerLine) {
    const ScriptedService service{{newest(7), awaited(), answering(eventBatch({7, 8})), waiting}};
    Program program{raidinfo({"events", "--json"})};
    const Result result = interrupt(program, service, 3);
    EXPECT_THAT(numbers(result.output), ElementsAre(7, 8));
}

TEST(EventsCommand, WritesEventsAsSoonAsTheyCome) {
    const ScriptedService service{{newest(7), awaited(), answering(eventBatch({7})), waiting}};
    Program program{raidinfo({"events", "--json"})};
    EXPECT_THAT(numbers(program.waitForOutput("\n")), ElementsAre(7));
    EXPECT_EQ(interrupt(program, service, 3).status, 130);
}

TEST(EventsCommand, EndsAtOnceWhenInterruptedAndNotAfterTheSliceOfTheWait) {
    const ScriptedService service{{newest(7), waiting}};
    Program program{raidinfo({"events"})};
    service.waitFor(1, Stage::answered);
    const auto start = std::chrono::steady_clock::now();
    program.signal(SIGTERM);
    EXPECT_EQ(program.finish().status, 143);
    EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds{3});
}

TEST(EventsCommand, ShowsNothingTwiceWhenAWaitFails) {
    // The failed wait publishes 41 and 42 again and advances the library's number to 45.
    const ScriptedService service{{newest(41), awaited(), answering(eventBatch({41, 42})), failing,
                                   failing, newest(44), awaited(),
                                   answering(eventBatch({42, 43, 44, 44})), waiting}};
    Program program{raidinfo({"events", "--json"})};
    const Result result = interrupt(program, service, 8);
    EXPECT_THAT(numbers(result.output), ElementsAre(41, 42, 43, 44));
    EXPECT_THAT(service.request(7), HasSubstr(">43</as:start>"));
    EXPECT_THAT(service.request(8), HasSubstr(">44</as:lastRetrieved>"));
}

TEST(EventsCommand, GoesOnAfterAnEmptyBatchAndAMalformedOne) {
    const ScriptedService service{{newest(3), awaited(), answering(eventBatch({})), newest(3),
                                   awaited(), answering("<"), newest(3), awaited(),
                                   answering(eventBatch({3, 4})), waiting}};
    Program program{raidinfo({"events", "--json"})};
    EXPECT_THAT(numbers(interrupt(program, service, 9).output), ElementsAre(3, 4));
}

TEST(EventsCommand, SaysThatTheServiceWentAway) {
    const ScriptedService service{
        {newest(41), awaited(), answering(eventBatch({41})), failing, failing, failing}};
    const Result result = run({"events", "--json"});
    EXPECT_THAT(numbers(result.output), ElementsAre(41));
    EXPECT_THAT(result.errors, HasSubstr("does not answer"));
    EXPECT_EQ(result.status, 69);
}

TEST(EventsCommand, FollowsFromTheLargestNumberThereIs) {
    const int largest = 2147483647;
    const ScriptedService service{
        {newest(largest), awaited(), answering(eventBatch({largest})), waiting}};
    Program program{raidinfo({"events", "--json"})};
    EXPECT_THAT(numbers(interrupt(program, service, 3).output), ElementsAre(largest));
}

}  // namespace
}  // namespace raidinfo::test
