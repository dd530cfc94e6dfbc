// A host that lives with signals: whatever call of the library they interrupt, nothing is lost.

#include <gtest/gtest.h>
#include <sys/socket.h>

#include <array>
#include <string>
#include <thread>
#include <vector>

#include "../agent/agent_documents.h"
#include "../agent/exchanged.h"
#include "RAIDInstrumentation.h"
#include "agent/saved_answers.h"
#include "diag/debug.h"
#include "interrupted_calls.h"
#include "signal_storm.h"
#include "support/busy_service.h"
#include "support/files.h"
#include "support/fresh_library.h"
#include "support/scripted_service.h"

namespace {

using namespace raid::test;

constexpr int many = 100;

// A text in which a missing piece shows.
std::string numbered(int lines) {
    std::string text;
    for (int line = 0; line < lines; ++line) {
        text += std::to_string(line) + "\n";
    }
    return text;
}

// Opens the gate once the storm has raged.
class OpenAfterStorm {
public:
    OpenAfterStorm(Gate& gate, const SignalStorm& storm)
        : thread([&] {
              storm.waitFor(many);
              gate.open();
          }) {}

private:
    std::jthread thread;
};

// The answer byte by byte, the last one held back by the gate.
std::vector<Piece> drops(const std::string& body, Gate& gate) {
    const std::string whole = answer(body);
    std::vector<Piece> pieces{whole.substr(0, whole.size() - body.size())};
    for (const char byte : body) {
        pieces.emplace_back(std::string(1, byte));
    }
    pieces.back().before = &gate;
    return pieces;
}

class Interruptions : public FreshLibrary {};

TEST_F(Interruptions, LeaveASlowExchangeWhole) {
    const std::string body = numbered(100);
    Gate gate;
    const ScriptedService service({{.pieces = drops(body, gate)}});
    const SignalStorm storm;
    const OpenAfterStorm opening(gate, storm);
    EXPECT_EQ(exchanged(), body);
    EXPECT_GE(SignalStorm::count(), many);
}

TEST_F(Interruptions, LeaveAWaitForTheFirstByteWhole) {
    Gate gate;
    const ScriptedService service({{.pieces = {Piece(answer("body"), &gate)}}});
    const SignalStorm storm;
    const OpenAfterStorm opening(gate, storm);
    EXPECT_EQ(exchanged(), "body");
}

// The queue of the service is full, so that the connection comes about at the second attempt only,
// a second later.
TEST_F(Interruptions, LeaveASlowConnectWhole) {
    const BusyService service;
    const SignalStorm storm;
    std::jthread serving([&] {
        storm.waitFor(many);
        service.makeRoom();
        const Socket filled = service.accept();
        const Socket client = service.accept();
        std::array<char, 256> request{};
        throwIfNegative(recv(client.get(), request.data(), request.size(), 0), "receive");
        const std::string text = answer("body");
        throwIfNegative(send(client.get(), text.data(), text.size(), MSG_NOSIGNAL), "send");
    });
    EXPECT_EQ(exchanged(), "body");
}

TEST_F(Interruptions, LoseNoConfigurationAndNoEvents) {
    Gate first;
    Gate second;
    Gate third;
    const ScriptedService service({{.pieces = {Piece(answer(systemNamed("whole")), &first)}},
                                   {.pieces = {Piece(answer("<any/>"), &second)}},
                                   {.pieces = drops(eventsNumbered(1, 3), third)}});
    const SignalStorm storm;
    {
        const OpenAfterStorm opening(first, storm);
        RAIDinit();
    }
    {
        std::jthread opening([&] {
            for (Gate* const gate : {&second, &third}) {
                storm.waitFor(many);
                gate->open();
            }
        });
        getEvent();
    }
    EXPECT_EQ(currentSystem(), "whole");
    EXPECT_EQ(getRAIDEventCount(), 3);
    EXPECT_EQ(nextSequenceNumber, 3);
}

TEST_F(Interruptions, LoseNothingOfASavedAnswer) {
    writeFile("events.xml", eventsNumbered(1, 1000));
    const InterruptedCalls calls;
    readEventRAIDXML("events.xml");
    EXPECT_EQ(currentEvents(), 1000);
    EXPECT_GE(InterruptedCalls::count(), 2);
}

TEST_F(Interruptions, LoseNothingOfTheSettings) {
    writeLogLevel(7);
    const InterruptedCalls calls;
    debug(100, "not written");
    EXPECT_EQ(LOG_LEVEL, 7);
    EXPECT_GE(InterruptedCalls::count(), 2);
}

TEST_F(Interruptions, LoseNothingOfTheLog) {
    configRead = 1;
    LOG_LEVEL = 1;
    const InterruptedCalls calls;
    debug(1, "first\n");
    debug(1, "second\n");
    EXPECT_EQ(InterruptedCalls::count(), 2);
    EXPECT_EQ(readLog(), "first\nsecond\n");
}

}  // namespace
