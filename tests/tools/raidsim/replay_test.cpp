#include "control/replay.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <memory>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "client.h"
#include "control/player.h"
#include "running_service.h"
#include "soap/envelope.h"

namespace raidsim {
namespace {

using namespace std::chrono_literals;
using recording::Entry;
using recording::Question;
using testing::ElementsAre;
using testing::HasSubstr;

std::string event(int number) {
    return "<ac:event><as:sequenceNumber>" + std::to_string(number) +
           "</as:sequenceNumber></ac:event>";
}

std::string events(const std::string& listed) {
    return "<e:Envelope>\n<!-- of another service -->\n<ac:events>" + listed +
           "</ac:events></e:Envelope>";
}

std::string newest(int number) { return soap::returnValueBody("m:getNewestEventResponse", number); }

constexpr const char* first = "<ac:system  ><as:name>oak</as:name></ac:system>";
constexpr const char* second = "<ac:system><as:name>elm</ac:system>";

class Replay : public testing::Test {
protected:
    void record(std::vector<Entry> entries) {
        auto recording = std::make_shared<recording::Recording>();
        recording->entries = std::move(entries);
        player = ScenarioPlayer(replayOf(recording));
        advanceTo(0ms);
    }
    void advanceTo(std::chrono::milliseconds elapsed) {
        player.advanceTo(elapsed, [&](const ScriptLine& line) { line.command(service); });
    }

    // "none" for a connection that ends without an answer.
    std::string ask(std::string_view request) {
        const auto reply = service.reply(std::get<http::Request>(http::parse(request)));
        const auto* const answer = std::get_if<http::Answer>(&reply);
        return answer == nullptr ? "none" : answer->body;
    }
    std::string configuration() { return ask(test::getConfig); }
    std::string newestEvent() { return ask(test::getNewestEvent()); }
    std::string eventsFrom(int start) { return ask(test::getEvents(start, start + 100)); }

    // What ends the waits, in that order.
    void wait(int lastRetrieved) {
        service.events().await(lastRetrieved,
                               [this](std::optional<int> number) { ended.push_back(number); });
    }

    Service service{Document::verbatim({}), "rec"};
    ScenarioPlayer player{std::vector<Step>()};
    std::vector<std::optional<int>> ended;
};

TEST_F(Replay, ServesTheConfigurationRecordedLast) {
    record({{10ms, Question::configuration, first}, {20ms, Question::configuration, second}});
    advanceTo(19ms);
    EXPECT_EQ(configuration(), first);
    advanceTo(20ms);
    EXPECT_EQ(configuration(), second);
    advanceTo(24h);
    EXPECT_EQ(configuration(), second);
}

TEST_F(Replay, ServesTheFirstAnswersBeforeTheyWereRecorded) {
    record({{10ms, Question::configuration, first},
            {20ms, Question::newestEvent, newest(40)},
            {30ms, Question::configuration, second}});
    EXPECT_EQ(configuration(), first);
    EXPECT_EQ(newestEvent(), newest(40));
}

TEST_F(Replay, AnswersNothingWhereTheExchangeFailed) {
    record({{0ms, Question::configuration, first},
            {1ms, Question::configuration, std::nullopt},
            {1ms, Question::newestEvent, std::nullopt},
            {1ms, Question::events, std::nullopt},
            {2ms, Question::configuration, second},
            {2ms, Question::newestEvent, newest(1)},
            {2ms, Question::events, events(event(1))}});
    advanceTo(1ms);
    EXPECT_EQ(configuration(), "none");
    EXPECT_EQ(newestEvent(), "none");
    EXPECT_EQ(eventsFrom(1), "none");
    EXPECT_EQ(ask(test::waitNextEvent(1)), "none");
    advanceTo(2ms);
    EXPECT_EQ(configuration(), second);
    EXPECT_EQ(eventsFrom(1), events(event(1)));
    EXPECT_THAT(newestEvent(), HasSubstr(">1</as:return>"));
}

TEST_F(Replay, AnswersNothingWhereTheConfigurationWasNotRecorded) {
    record({{0ms, Question::newestEvent, newest(3)}});
    EXPECT_EQ(configuration(), "none");
}

TEST_F(Replay, AnswersFromTheEventsWhereTheNewestWasNotRecorded) {
    record({{5ms, Question::events, events(event(7))}});
    EXPECT_THAT(newestEvent(), HasSubstr(">0</as:return>"));
    advanceTo(5ms);
    EXPECT_THAT(newestEvent(), HasSubstr(">7</as:return>"));
}

TEST_F(Replay, EventsBecomeKnownAtTheirTimes) {
    record({{0ms, Question::newestEvent, newest(40)},
            {5ms, Question::events, events("\n\t" + event(41) + event(42))},
            {9ms, Question::events, events(event(43))}});
    wait(40);
    advanceTo(4ms);
    EXPECT_THAT(ended, ElementsAre());
    advanceTo(5ms);
    EXPECT_THAT(ended, ElementsAre(41));
    EXPECT_EQ(eventsFrom(41), events("\n\t" + event(41) + event(42)));
    EXPECT_THAT(newestEvent(), HasSubstr(">42</as:return>"));
    wait(42);
    advanceTo(9ms);
    EXPECT_THAT(ended, ElementsAre(41, 43));
    EXPECT_EQ(eventsFrom(43), events(event(43)));
    EXPECT_EQ(eventsFrom(44), events(""));
}

TEST_F(Replay, GivesUpThoseWhoWaitWhenAnExchangeFailed) {
    record({{5ms, Question::events, std::nullopt}});
    wait(0);
    advanceTo(5ms);
    EXPECT_THAT(ended, ElementsAre(std::nullopt));
}

TEST_F(Replay, ServesEventsThatNobodyCanReadAsTheyWere) {
    record({{1ms, Question::events, events(event(1))},
            {5ms, Question::events, "<cut"},
            {9ms, Question::events, events(event(2))}});
    advanceTo(1ms);
    wait(1);
    advanceTo(5ms);
    EXPECT_THAT(ended, ElementsAre(2));
    EXPECT_EQ(eventsFrom(2), "<cut");
    wait(1);
    advanceTo(9ms);
    EXPECT_THAT(ended, ElementsAre(2, 2));
    EXPECT_EQ(eventsFrom(1), events(event(1) + event(2)));
}

TEST_F(Replay, ServesANewestEventThatNobodyCanReadAsItWas) {
    record({{1ms, Question::newestEvent, "<none"}, {2ms, Question::newestEvent, newest(7) + "<"}});
    EXPECT_EQ(newestEvent(), "<none");
    advanceTo(2ms);
    EXPECT_EQ(newestEvent(), newest(7) + "<");
}

TEST_F(Replay, ForgetsWhatLiesAboveTheNewestEvent) {
    record({{1ms, Question::events, events(event(41) + event(42))},
            {5ms, Question::newestEvent, newest(2)},
            {9ms, Question::events, events(event(3))}});
    advanceTo(5ms);
    EXPECT_EQ(eventsFrom(1), events(""));
    wait(2);
    advanceTo(9ms);
    EXPECT_THAT(ended, ElementsAre(3));
    EXPECT_EQ(eventsFrom(3), events(event(3)));
}

TEST_F(Replay, TellsTheNewestAgainWhenNothingNewCame) {
    record({{1ms, Question::events, events(event(7))},
            {2ms, Question::newestEvent, newest(7)},
            {3ms, Question::events, events(event(7))}});
    advanceTo(3ms);
    EXPECT_EQ(newestEvent(), newest(7));
}

TEST_F(Replay, FaultsMeetTheRecordedAnswers) {
    record({{0ms, Question::configuration, first}, {0ms, Question::newestEvent, newest(7)}});
    EXPECT_EQ(service.goodBody(RequestKind::config), first);
    EXPECT_EQ(service.goodBody(RequestKind::newest), newest(7));
}

TEST_F(Replay, CommandsChangeWhatIsReplayed) {
    record({{0ms, Question::configuration,
             "<e:Envelope><ac:system><as:name>oak</as:name></ac:system></e:Envelope>"},
            {0ms, Question::newestEvent, newest(40)},
            {5ms, Question::configuration, first}});
    EXPECT_THROW(run("set system name=ash", service), CommandError);
    run("event type=Critical", service);
    EXPECT_THAT(eventsFrom(41), HasSubstr(">41</as:sequenceNumber>"));
    EXPECT_THAT(newestEvent(), HasSubstr(">41</as:return>"));
    advanceTo(5ms);
    EXPECT_EQ(configuration(), first);
    run("set system name=ash", service);
    EXPECT_THAT(configuration(), HasSubstr("<as:name>ash</as:name>"));
    run("forget", service);
    EXPECT_THAT(newestEvent(), HasSubstr(">0</as:return>"));
}

TEST_F(Replay, ReloadedDocumentIsServedUntilTheNextRecordedOne) {
    record({{0ms, Question::configuration, std::nullopt}, {5ms, Question::configuration, second}});
    service.serve(Document::parse("<ac:system/>"));
    EXPECT_THAT(configuration(), HasSubstr("<ac:system></ac:system>"));
    advanceTo(5ms);
    EXPECT_EQ(configuration(), second);
}

}  // namespace
}  // namespace raidsim
