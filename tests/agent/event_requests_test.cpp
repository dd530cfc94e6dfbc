// The event requests, byte by byte, and what becomes of their answers.

#include <gtest/gtest.h>

#include <climits>
#include <string>
#include <vector>

#include "agent_documents.h"
#include "support/files.h"
#include "support/fresh_library.h"
#include "support/scripted_service.h"

namespace {

using namespace raid::test;

std::string post(int length, const std::string& method, const std::string& arguments) {
    return "POST /SOAPService/RaidMonitor HTTP/1.1\n"
           "Content-Type: application/soap+xml; charset=\"utf-8\"\n"
           "Content-Length:" +
           std::to_string(length) +
           "\n\n"
           "<?xml version='1.0' ?>"
           "<env:Envelope xmlns:env=\"http://www.w3.org/2002/12/soap-envelope\""
           " xmlns:xsi=\"http://www.w3.org/2001/XMLSchema-instance\""
           " xmlns:xsd=\"http://www.w3.org/2001/XMLSchema-datatypes\">"
           "<env:Body><m:" +
           method +
           " xmlns:m=\"http://localhost/soap/v1/method\""
           " xmlns:as=\"http://localhost/soap/v1/argSimple\">" +
           arguments + "</m:" + method + "></env:Body></env:Envelope>";
}

std::string wait(int length, const std::string& last) {
    return post(length, "waitNextEvent",
                "<as:lastRetrieved xsi:type=\"xsd:int\">" + last + "</as:lastRetrieved>");
}

std::string range(int length, const std::string& first, const std::string& last) {
    return post(length, "getEvents",
                "<as:start xsi:type=\"xsd:int\">" + first +
                    "</as:start><as:end xsi:type=\"xsd:int\">" + last + "</as:end>");
}

struct Requests {
    int number;
    std::string wait;
    std::string range;
};

class EventRequests : public FreshLibrary {};

TEST_F(EventRequests, CarryTheNumberBeforeAndTheHundredBehind) {
    for (const auto& [number, waiting, reading] : {
             Requests{0, wait(413, "0"), range(428, "0", "100")},
             Requests{1, wait(413, "0"), range(428, "1", "101")},
             Requests{57, wait(414, "56"), range(429, "57", "157")},
             Requests{-1, wait(414, "-2"), range(428, "-1", "99")},
             // Numbers wrap around.
             Requests{INT_MIN, wait(422, "2147483647"), range(446, "-2147483648", "-2147483548")},
             Requests{INT_MAX, wait(422, "2147483646"), range(445, "2147483647", "-2147483549")},
         }) {
        const ScriptedService service({answering("<any/>"), answering(eventsNumbered(number, 1))});
        EXPECT_EQ(getEventRAIDXML(number), 0);
        EXPECT_EQ(service.request(0), waiting);
        EXPECT_EQ(service.request(1), reading);
        EXPECT_EQ(currentEvents(), 1);
    }
}

TEST_F(EventRequests, AskForTheNewestEventWithoutArguments) {
    const ScriptedService service({answering(newestEventDocument("17"))});
    EXPECT_EQ(getNewestEventRAIDXML(), 17);
    EXPECT_EQ(service.request(0), post(358, "getNewestEvent", ""));
}

TEST_F(EventRequests, AnnounceTheLengthOfTheirEnvelope) {
    const ScriptedService service({answering(newestEventDocument("17")), answering("<any/>"),
                                   answering(eventsNumbered(40, 1))});
    (void)getNewestEventRAIDXML();
    getEventRAIDXML(40);
    for (const std::size_t each : {0U, 1U, 2U}) {
        const std::string request = service.request(each);
        constexpr std::string_view name = "\nContent-Length:";
        const std::string length = request.substr(request.find(name) + name.size());
        EXPECT_EQ(std::stoul(length), request.size() - request.find("\n\n") - 2);
    }
}

TEST_F(EventRequests, TellThatNobodyKnowsTheNewestEvent) {
    EXPECT_EQ(getNewestEventRAIDXML(), -1) << "no service";
    const ScriptedService service({Connection{}, answering("no envelope")});
    EXPECT_EQ(getNewestEventRAIDXML(), -1) << "no answer";
    EXPECT_EQ(getNewestEventRAIDXML(), 0) << "no number";
}

TEST_F(EventRequests, KeepTheBatchWhenNoAnswerComes) {
    process(processEventXML, eventsNumbered(1, 3));
    getEventRAIDXML(4);
    EXPECT_EQ(currentEvents(), 3) << "no service";
    const ScriptedService service({answering("<any/>"), Connection{}});
    getEventRAIDXML(4);
    EXPECT_EQ(currentEvents(), 3) << "no answer";
}

TEST_F(EventRequests, LeaveNoBatchWhenTheAnswerIsMalformed) {
    process(processEventXML, eventsNumbered(1, 3));
    const ScriptedService service({answering("<any/>"), answering(eventsDocument("<ac:events>"))});
    getEventRAIDXML(4);
    EXPECT_EQ(currentEvents(), -1);
}

TEST_F(EventRequests, ReadTheEventsWhateverTheWaitBrought) {
    // No answer, a malformed one, and one of another kind.
    for (const Connection& waiting :
         {Connection{}, answering("<<<"), answering(newestEventDocument("3"))}) {
        const ScriptedService service({waiting, answering(eventsNumbered(4, 2))});
        process(processEventXML, "");
        EXPECT_EQ(getEventRAIDXML(4), 0);
        EXPECT_EQ(currentEvents(), 2);
    }
}

// The log without the lines of the exchanges, from "RAIDCommunication" to the last one of each.
std::string withoutExchanges(std::string log) {
    constexpr std::string_view last = "Return from getSOPEData\n";
    for (auto start = log.find("RAIDCommunication\n"); start != log.npos;
         start = log.find("RAIDCommunication\n")) {
        log.replace(start, log.find(last, start) + last.size() - start, "[exchange]");
    }
    return log;
}

TEST_F(EventRequests, AreLoggedWithTheirAnswers) {
    writeLogLevel(8);
    const std::string events = eventsNumbered(4, 1);
    const ScriptedService service({answering("<any/>"), answering(events)});
    getEventRAIDXML(4);
    EXPECT_EQ(withoutExchanges(readLog()),
              "getEventRAIDXML entry\n[exchange]<any/>getEventRAIDXML after wait\n[exchange]" +
                  events + "getEventRAIDXML exit\n");
}

TEST_F(EventRequests, AreLoggedWithTheirMissingAnswers) {
    writeLogLevel(8);
    const ScriptedService service({Connection{}, Connection{}});
    getEventRAIDXML(4);
    EXPECT_EQ(withoutExchanges(readLog()),
              "getEventRAIDXML entry\n[exchange](null)getEventRAIDXML after wait\n"
              "[exchange](null)getEventRAIDXML exit\n");
}

TEST_F(EventRequests, LogTheAnswerThatNamesTheNewestEvent) {
    writeLogLevel(8);
    const std::string newest = newestEventDocument("17");
    const ScriptedService service({answering(newest)});
    (void)getNewestEventRAIDXML();
    EXPECT_EQ(withoutExchanges(readLog()),
              "getNewestEventRAIDXML entry\n[exchange]getNewestEventRAIDXML exit\n" + newest +
                  "before atoi\nafter atoi\nbefore free\nafter free\n");
}

TEST_F(EventRequests, LogNoAnswerThatNamesTheNewestEventWhenNoneCame) {
    writeLogLevel(8);
    const ScriptedService service({Connection{}});
    (void)getNewestEventRAIDXML();
    EXPECT_EQ(withoutExchanges(readLog()),
              "getNewestEventRAIDXML entry\n[exchange]getNewestEventRAIDXML exit\n");
}

}  // namespace
