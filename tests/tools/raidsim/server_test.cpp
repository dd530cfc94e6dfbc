#include "net/server.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <boost/system/system_error.hpp>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "bounds.h"
#include "client.h"
#include "control/command.h"
#include "running_service.h"
#include "support/files.h"

namespace raidsim::test {
namespace {

using namespace std::chrono_literals;
using testing::EndsWith;
using testing::HasSubstr;
using testing::StartsWith;

TEST(Server, AnswersWithTheExactBytesAndCloses) {
    RunningService service({}, "<ac:system/>");
    const std::string body =
        "<?xml version=\"1.0\" encoding=\"utf-8\"?>\n"
        "<env:Envelope xmlns:env=\"http://www.w3.org/2002/12/soap-envelope\" "
        "xmlns:xsi=\"http://www.w3.org/2001/XMLSchema-instance\" "
        "xmlns:xsd=\"http://www.w3.org/2001/XMLSchema-datatypes\" "
        "xmlns:m=\"http://localhost/soap/v1/method\" "
        "xmlns:as=\"http://localhost/soap/v1/argSimple\" "
        "xmlns:ac=\"http://localhost/soap/v1/argComplex\" "
        "xmlns:o=\"http://localhost/soap/v1/object\">\n"
        "  <env:Body>\n"
        "    <m:getConfigResponse>\n"
        "      <ac:system></ac:system>\n"
        "    </m:getConfigResponse>\n"
        "  </env:Body>\n"
        "</env:Envelope>\n";
    EXPECT_EQ(ask(service.port(), getConfig),
              "HTTP/1.1 200 OK\n"
              "Content-Type: application/soap+xml; charset=\"utf-8\"\n"
              "Content-Length: " +
                  std::to_string(body.size()) +
                  "\n"
                  "Connection: close\n"
                  "\n" +
                  body);
}

TEST(Server, UnderstandsARequestThatArrivesByteByByte) {
    RunningService service;
    Client client(service.port());
    for (const char byte : getNewestEvent())
        client.send(std::string_view(&byte, 1));
    EXPECT_THAT(client.receive(), HasSubstr(">0</as:return>"));
}

TEST(Server, AnswersAClientThatHasStoppedSending) {
    RunningService service;
    Client client(service.port());
    client.send(getConfig);
    client.endSending();
    EXPECT_THAT(client.receive(), StartsWith("HTTP/1.1 200 OK\n"));
}

TEST(Server, WaitBlocksUntilANewerEventExists) {
    RunningService service;
    service.command("event type=Information");
    Client client(service.port());
    client.send(waitNextEvent(2));
    service.awaitWaiting(1);
    service.command("event type=Information");
    EXPECT_EQ(service.waiting(), 1U);  // event 2 is not newer than 2
    EXPECT_FALSE(client.isAnswered());
    service.command("event type=Information");
    EXPECT_THAT(bodyOf(client.receive()),
                HasSubstr("    <m:waitNextEventResponse>\n"
                          "      <as:return xsi:type=\"xsd:int\">3</as:return>\n"
                          "    </m:waitNextEventResponse>\n"));
}

TEST(Server, WaitForAnEventThatExistsIsAnsweredAtOnce) {
    RunningService service;
    service.command("event type=Information");
    EXPECT_THAT(ask(service.port(), waitNextEvent(0)), HasSubstr(">1</as:return>"));
}

TEST(Server, OthersAreServedWhileClientsWait) {
    RunningService service;
    std::vector<std::unique_ptr<Client>> waiting;
    for (int i = 0; i < 5; ++i) {
        waiting.push_back(std::make_unique<Client>(service.port()));
        waiting.back()->send(waitNextEvent(0));
    }
    service.awaitWaiting(5);
    EXPECT_THAT(ask(service.port(), getConfig), StartsWith("HTTP/1.1 200 OK\n"));
    EXPECT_THAT(ask(service.port(), getNewestEvent()), HasSubstr(">0</as:return>"));
    service.command("event type=Information");
    for (const auto& client : waiting)
        EXPECT_THAT(client->receive(), HasSubstr(">1</as:return>"));
    EXPECT_THAT(ask(service.port(), getEvents(1, 101)), HasSubstr(">1</as:sequenceNumber>"));
}

TEST(Server, ForgetsAClientThatLeavesWhileItWaits) {
    RunningService service;
    Client staying(service.port());
    staying.send(waitNextEvent(0));
    service.awaitWaiting(1);
    {
        Client leaving(service.port());
        leaving.send(waitNextEvent(0));
        service.awaitWaiting(2);
    }
    service.awaitWaiting(1);
    service.awaitClients(1);
    service.command("event type=Information");
    EXPECT_THAT(staying.receive(), HasSubstr(">1</as:return>"));
    service.awaitClients(0);
}

TEST(Server, ReloadIsSeenByTheNextRequest) {
    RunningService service;
    service.command("set system name=elm");
    EXPECT_THAT(ask(service.port(), getConfig), HasSubstr("<as:name>elm</as:name>"));
}

TEST(Server, AnswersBadRequestsWithAFault) {
    RunningService service;
    const std::string answer = ask(service.port(), "nonsense\n\n");
    EXPECT_THAT(answer, StartsWith("HTTP/1.1 400 Bad Request\n"));
    EXPECT_THAT(bodyOf(answer), HasSubstr("<env:Fault>"));
}

TEST(Server, AnswersARequestThatEndsEarly) {
    RunningService service;
    Client client(service.port());
    client.send("POST /SOAPService/RaidMonitor HTTP/1.1\nContent-Length:100\n\nabc");
    client.endSending();
    EXPECT_THAT(client.receive(), StartsWith("HTTP/1.1 400 Bad Request\n"));
}

TEST(Server, ClosesOnAClientThatSendsNothing) {
    RunningService service;
    Client client(service.port());
    client.endSending();
    EXPECT_EQ(client.receive(), "");
}

TEST(Server, AnswersTooLongARequestAlthoughTheClientGoesOnSending) {
    RunningService service;
    EXPECT_THAT(ask(service.port(), std::string(4 * bounds::headerBytes, 'x')),
                StartsWith("HTTP/1.1 431 "));
    EXPECT_THAT(ask(service.port(), post(std::string(4 * bounds::requestBodyBytes, ' '))),
                StartsWith("HTTP/1.1 413 "));
}

TEST(Server, DeeplyNestedRequestIsRefused) {
    RunningService service;
    std::string nested;
    while (nested.size() + 3 <= bounds::requestBodyBytes)
        nested += "<a>";
    EXPECT_THAT(ask(service.port(), post(nested)), HasSubstr("nested too deeply"));
}

TEST(Server, RequestThatDoesNotArriveInTimeIsAnsweredSo) {
    ServerSettings settings;
    settings.requestTime = 1ms;
    RunningService service(settings);
    Client client(service.port());
    EXPECT_THAT(client.receive(), StartsWith("HTTP/1.1 408 Request Timeout\n"));
}

TEST(Server, DropsAClientThatStaysAfterItsAnswer) {
    ServerSettings settings;
    settings.drainTime = 1ms;
    RunningService service(settings);
    Client client(service.port());
    client.send(getConfig);
    EXPECT_THAT(client.receive(), StartsWith("HTTP/1.1 200 OK\n"));
    service.awaitClients(0);
}

TEST(Server, RefusesClientsBeyondItsLimit) {
    ServerSettings settings;
    settings.clients = 1;
    RunningService service(settings);
    Client first(service.port());
    first.send(waitNextEvent(0));
    service.awaitWaiting(1);
    Client second(service.port());
    EXPECT_THAT(second.receive(), StartsWith("HTTP/1.1 503 Service Unavailable\n"));
    service.command("event type=Information");
    EXPECT_THAT(first.receive(), StartsWith("HTTP/1.1 200 OK\n"));
}

TEST(Server, StoppingDropsThoseWhoWait) {
    std::optional<RunningService> service(std::in_place);
    Client client(service->port());
    client.send(waitNextEvent(0));
    service->awaitWaiting(1);
    service.reset();
    EXPECT_EQ(client.receive(), "");
}

TEST(Server, IsNotThereWhileItIsDownAndForgetsNothing) {
    RunningService service;
    service.command("event type=Information");
    service.command("down");
    EXPECT_THROW(Client{service.port()}, boost::system::system_error);
    service.command("up");
    EXPECT_THAT(ask(service.port(), getNewestEvent()), HasSubstr(">1</as:return>"));
}

TEST(Server, ResetsEveryConnectionWhenItGoesDown) {
    RunningService service;
    Client waiting(service.port());
    waiting.send(waitNextEvent(0));
    service.awaitWaiting(1);
    Client silent(service.port());
    service.awaitClients(2);
    service.command("down");
    for (Client* const client : {&waiting, &silent}) {
        try {
            (void)client->receive();
            FAIL() << "the connection ended in good order";
        } catch (const boost::system::system_error& error) {
            EXPECT_EQ(error.code(), boost::asio::error::connection_reset);
        }
    }
    EXPECT_EQ(service.clients(), 0U);
    EXPECT_EQ(service.waiting(), 0U);
}

TEST(Server, LeavesAnAnswerToWhoHasItWhenItGoesDown) {
    RunningService service;
    Client client(service.port());
    client.send(getConfig);
    client.awaitWholeAnswer();
    service.command("down");
    EXPECT_THAT(client.receive(), EndsWith("</env:Envelope>\n"));
}

TEST(Server, StaysDownWhenItCannotListen) {
    RunningService service;
    service.command("down");
    ServerSettings settings;
    settings.port = service.port();
    boost::asio::io_context context;
    Service other = makeService(smallSystem());
    std::optional<Server> inTheWay(std::in_place, context, other, settings);
    EXPECT_THROW(service.command("up"), CommandError);
    inTheWay.reset();
    service.command("up");
    EXPECT_THAT(ask(service.port(), getConfig), StartsWith("HTTP/1.1 200 OK\n"));
}

TEST(Server, IsDownAndUpWhileAFaultRefusesConnections) {
    raid::test::writeFile("refuse.fault", "title \"Is not there\"\nrefuse\n");
    RunningService service;
    service.command("fault refuse.fault");
    service.command("down");
    service.command("fault off");
    EXPECT_THROW(Client{service.port()}, boost::system::system_error);
    service.command("up");
    EXPECT_THAT(ask(service.port(), getConfig), StartsWith("HTTP/1.1 200 OK\n"));
}

TEST(Server, ClosesInGoodOrderWhereNothingIsAnswered) {
    RunningService service;
    service.silence(RequestKind::config);
    EXPECT_EQ(ask(service.port(), getConfig), "");
    Client waiting(service.port());
    waiting.send(waitNextEvent(0));
    service.awaitWaiting(1);
    service.giveWaitersUp();
    EXPECT_EQ(waiting.receive(), "");
}

TEST(Server, PortInUseIsAnError) {
    RunningService first;
    boost::asio::io_context context;
    Service service = makeService(smallSystem());
    ServerSettings settings;
    settings.port = first.port();
    EXPECT_THROW(Server(context, service, settings), boost::system::system_error);
}

}  // namespace
}  // namespace raidsim::test
