#include "support/scripted_service.h"

#include <gmock/gmock.h>
#include <gtest/gtest-spi.h>
#include <gtest/gtest.h>
#include <sys/socket.h>

#include <array>
#include <cerrno>

namespace {

using namespace raid::test;

constexpr std::string_view get = "GET /somewhere HTTP/1.1\r\n\r\n";

Socket connectAndSend(std::string_view request) {
    Socket socket = Socket::connected();
    throwIfNegative(send(socket.get(), request.data(), request.size(), MSG_NOSIGNAL), "send");
    return socket;
}

std::string receiveOnce(const Socket& socket) {
    std::array<char, 4096> buffer{};
    const ssize_t received = recv(socket.get(), buffer.data(), buffer.size(), 0);
    throwIfNegative(received, "receive");
    return {buffer.data(), static_cast<std::size_t>(received)};
}

std::string receiveAll(const Socket& socket) {
    std::string all;
    for (std::string part = receiveOnce(socket); !part.empty(); part = receiveOnce(socket)) {
        all += part;
    }
    return all;
}

TEST(ScriptedService, RecordsTheExactRequestAndAnswersIt) {
    ScriptedService service({answering("<x/>")});
    const Socket client = connectAndSend(get);
    EXPECT_EQ(receiveAll(client), answer("<x/>"));
    EXPECT_EQ(service.request(0), get);
}

TEST(ScriptedService, WaitsForTheBodyThatTheRequestAnnounces) {
    ScriptedService service({answering("")});
    const Socket client = connectAndSend("POST /x HTTP/1.1\nContent-Length:4\n\n12");
    EXPECT_EQ(send(client.get(), "34", 2, MSG_NOSIGNAL), 2);
    EXPECT_EQ(receiveAll(client), answer(""));
    EXPECT_EQ(service.request(0), "POST /x HTTP/1.1\nContent-Length:4\n\n1234");
}

TEST(ScriptedService, SendsEachPieceAfterTheOneBeforeItWasTaken) {
    ScriptedService service({{.pieces = {"one", "two", "three"}}});
    const Socket client = connectAndSend(get);
    EXPECT_EQ(receiveOnce(client), "one");
    EXPECT_EQ(receiveOnce(client), "two");
    EXPECT_EQ(receiveOnce(client), "three");
    EXPECT_EQ(receiveOnce(client), "");
}

TEST(ScriptedService, HoldsAPieceBackUntilItsGateOpens) {
    Gate gate;
    ScriptedService service({{.pieces = {"one", {"two", &gate}}}});
    const Socket client = connectAndSend(get);
    EXPECT_EQ(receiveOnce(client), "one");
    std::array<char, 1> byte{};
    EXPECT_EQ(recv(client.get(), byte.data(), byte.size(), MSG_DONTWAIT), -1);
    EXPECT_EQ(errno, EAGAIN);
    gate.open();
    EXPECT_EQ(receiveOnce(client), "two");
}

TEST(ScriptedService, ResetsTheConnection) {
    Gate gate;
    ScriptedService service({{.pieces = {"one"}, .beforeEnd = &gate, .end = End::reset}});
    const Socket client = connectAndSend(get);
    EXPECT_EQ(receiveOnce(client), "one");
    gate.open();
    std::array<char, 1> byte{};
    EXPECT_EQ(recv(client.get(), byte.data(), byte.size(), 0), -1);
    EXPECT_EQ(errno, ECONNRESET);
}

TEST(ScriptedService, EndsWhileItHoldsAConnectionOpen) {
    ScriptedService service({{.pieces = {"one"}, .end = End::hold}});
    const Socket client = connectAndSend(get);
    EXPECT_EQ(receiveOnce(client), "one");
    service.waitFor(0, Stage::answered);
}

TEST(ScriptedService, SeesTheClientCloseAHeldConnection) {
    ScriptedService service({{.pieces = {"one"}, .end = End::hold}});
    connectAndSend(get).close();
    service.waitFor(0, Stage::ended);
}

TEST(ScriptedService, ServesConnectionsSideBySide) {
    Gate gate;
    ScriptedService service({{.pieces = {{"late", &gate}}}, {.pieces = {"early"}}});
    const Socket first = connectAndSend(get);
    service.waitFor(0, Stage::requestRead);
    const Socket second = connectAndSend(get);
    EXPECT_EQ(receiveAll(second), "early");
    gate.open();
    EXPECT_EQ(receiveAll(first), "late");
    EXPECT_EQ(service.connectionCount(), 2U);
}

TEST(ScriptedService, FailsATestThatMakesAnUnscriptedConnection) {
    EXPECT_NONFATAL_FAILURE(
        {
            const ScriptedService service({});
            EXPECT_EQ(receiveAll(Socket::connected()), "");
        },
        "connections made");
}

TEST(ScriptedService, FailsATestThatLeavesALineOfTheScriptUnplayed) {
    EXPECT_NONFATAL_FAILURE({ const ScriptedService service({answering("")}); },
                            "connections scripted");
}

}  // namespace
