// A host that lives with signals: whatever call of the library they interrupt, nothing is lost.

#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/socket.h>
#include <unistd.h>

#include <array>
#include <csignal>
#include <filesystem>
#include <string>
#include <string_view>
#include <thread>
#include <vector>

#include "../agent/agent_documents.h"
#include "../agent/exchanged.h"
#include "RAIDInstrumentation.h"
#include "agent/saved_answers.h"
#include "diag/debug.h"
#include "signal_storm.h"
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
    const Socket listener = Socket::listening();
    throwIfNegative(listen(listener.get(), 0), "shorten the queue");
    const Socket filling = Socket::connected();
    const SignalStorm storm;
    std::jthread serving([&] {
        storm.waitFor(many);
        throwIfNegative(listen(listener.get(), SOMAXCONN), "lengthen the queue");
        const Socket filled(accept4(listener.get(), nullptr, nullptr, SOCK_CLOEXEC));
        const Socket client(accept4(listener.get(), nullptr, nullptr, SOCK_CLOEXEC));
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
    writeFile("events.xml", eventsNumbered(1, 20'000));
    const SignalStorm storm;
    while (SignalStorm::count() < many) {
        readEventRAIDXML("events.xml");
        ASSERT_EQ(currentEvents(), 20'000);
    }
}

TEST_F(Interruptions, LoseNothingOfTheSettings) {
    const std::string_view setting = "\nLogLevel=7\n";
    writeFile(settingsPath, std::string(1024 * 1024 - setting.size(), '#').append(setting));
    const SignalStorm storm;
    while (SignalStorm::count() < many) {
        configRead = 0;
        LOG_LEVEL = 0;
        debug(100, "not written");
        ASSERT_EQ(LOG_LEVEL, 7);
    }
}

TEST_F(Interruptions, LoseNothingOfTheLog) {
    const auto logged = [] {
        std::filesystem::remove(logPath);
        configRead = 1;
        LOG_LEVEL = 9;
        const ScriptedService service({answering(systemNamed("traced"))});
        RAIDinit();
        return readLog();
    };
    // The same steps once more, so that the descriptors that it names are the same.
    const std::string quiet = logged();
    ASSERT_FALSE(quiet.empty());
    const SignalStorm storm;
    while (SignalStorm::count() < many) {
        std::string loud = logged();
        const auto handle = [](const std::string& log) {
            constexpr std::string_view line = "Socket handle=";
            const auto start = log.find(line);
            return log.substr(start, log.find('\n', start) - start);
        };
        loud.replace(loud.find(handle(loud)), handle(loud).size(), handle(quiet));
        ASSERT_EQ(loud, quiet);
    }
}

std::vector<sighandler_t> dispositions() {
    std::vector<sighandler_t> all;
    for (int number = 1; number < NSIG; ++number) {
        struct sigaction current {};
        all.push_back(sigaction(number, nullptr, &current) == 0 ? current.sa_handler : SIG_ERR);
    }
    return all;
}

TEST_F(Interruptions, AreHandledAsTheHostHasArranged) {
    const auto before = dispositions();
    ASSERT_EQ(before.at(SIGPIPE - 1), SIG_DFL);
    {
        const ScriptedService service({{.readsRequest = false, .end = End::reset},
                                       {.readsRequest = false},
                                       {.end = End::reset},
                                       {.pieces = {"HTTP"}, .end = End::reset}});
        RAIDinit();
        getEvent();
        enableRAIDEvent();
    }
    EXPECT_EQ(dispositions(), before);
}

}  // namespace
