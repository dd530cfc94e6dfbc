#include "service.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

#include "client.h"
#include "running_service.h"

namespace raidsim {
namespace {

using testing::HasSubstr;

constexpr const char* answerStart =
    "<?xml version=\"1.0\" encoding=\"utf-8\"?>\n"
    "<env:Envelope xmlns:env=\"http://www.w3.org/2002/12/soap-envelope\" "
    "xmlns:xsi=\"http://www.w3.org/2001/XMLSchema-instance\" "
    "xmlns:xsd=\"http://www.w3.org/2001/XMLSchema-datatypes\" "
    "xmlns:m=\"http://localhost/soap/v1/method\" "
    "xmlns:as=\"http://localhost/soap/v1/argSimple\" "
    "xmlns:ac=\"http://localhost/soap/v1/argComplex\" "
    "xmlns:o=\"http://localhost/soap/v1/object\">\n"
    "  <env:Body>\n";
constexpr const char* answerEnd =
    "  </env:Body>\n"
    "</env:Envelope>\n";

class ServiceReply : public testing::Test {
protected:
    http::Answer answerTo(std::string_view bytes) {
        return std::get<http::Answer>(service.reply(std::get<http::Request>(http::parse(bytes))));
    }
    static std::string enveloped(const std::string& content) {
        return answerStart + content + answerEnd;
    }

    Service service = test::makeService("<ac:system><as:name>oak</as:name></ac:system>");
};

TEST_F(ServiceReply, ConfigurationIsTheDocumentInItsEnvelope) {
    const http::Answer answer = answerTo(test::getConfig);
    EXPECT_EQ(answer.status, 200);
    EXPECT_EQ(answer.body, enveloped("    <m:getConfigResponse>\n"
                                     "      <ac:system>\n"
                                     "        <as:name>oak</as:name>\n"
                                     "      </ac:system>\n"
                                     "    </m:getConfigResponse>\n"));
}

TEST_F(ServiceReply, DocumentWithAnEnvelopeOfItsOwnKeepsIt) {
    service = test::makeService(
        "<env:Envelope a='b'><env:Body><m:getConfigResponse><ac:system/></m:getConfigResponse>"
        "</env:Body></env:Envelope>");
    EXPECT_EQ(answerTo(test::getConfig).body,
              "<?xml version=\"1.0\" encoding=\"utf-8\"?>\n"
              "<env:Envelope a=\"b\">\n"
              "  <env:Body>\n"
              "    <m:getConfigResponse>\n"
              "      <ac:system></ac:system>\n"
              "    </m:getConfigResponse>\n"
              "  </env:Body>\n"
              "</env:Envelope>\n");
}

TEST_F(ServiceReply, NewestEventIsOneReturnElement) {
    service.addEvent({{"sequenceNumber", "41"}});
    EXPECT_EQ(answerTo(test::getNewestEvent()).body,
              enveloped("    <m:getNewestEventResponse>\n"
                        "      <as:return xsi:type=\"xsd:int\">41</as:return>\n"
                        "    </m:getNewestEventResponse>\n"));
}

TEST_F(ServiceReply, NewestEventOfAnEmptyLogIsZero) {
    EXPECT_THAT(answerTo(test::getNewestEvent()).body, HasSubstr(">0</as:return>"));
}

TEST_F(ServiceReply, EventsAreTheRangeInDocumentOrder) {
    for (int i = 0; i < 3; ++i)
        service.addEvent({{"date", "D"}, {"serverName", "S"}, {"serverAddress", "A"}});
    const auto event = [](const std::string& number) {
        return "        <ac:event xsi:type=\"o:Event\">\n"
               "          <as:sequenceNumber xsi:type=\"xsd:int\">" +
               number +
               "</as:sequenceNumber>\n"
               "          <as:date xsi:type=\"xsd:string\">D</as:date>\n"
               "          <as:serverName xsi:type=\"xsd:string\">S</as:serverName>\n"
               "          <as:serverAddress xsi:type=\"xsd:string\">A</as:serverAddress>\n"
               "        </ac:event>\n";
    };
    EXPECT_EQ(answerTo(test::getEvents(2, 102)).body,
              enveloped("    <m:getEventsResponse>\n"
                        "      <ac:events xsi:type=\"o:Events\">\n" +
                        event("2") + event("3") +
                        "      </ac:events>\n"
                        "    </m:getEventsResponse>\n"));
}

TEST_F(ServiceReply, EventListRequestIsAnsweredWithAllEvents) {
    service.addEvent({{"string", "first"}});
    service.addEvent({{"string", "second"}});
    const std::string body =
        answerTo("GET /SOAPService/RaidMonitor?getEvents HTTP/1.1 Accept */*\r\n\r\n").body;
    EXPECT_THAT(body, HasSubstr("first"));
    EXPECT_THAT(body, HasSubstr("second"));
}

TEST_F(ServiceReply, EmptyRangeIsAnEmptyList) {
    EXPECT_EQ(answerTo(test::getEvents(0, 100)).body,
              enveloped("    <m:getEventsResponse>\n"
                        "      <ac:events xsi:type=\"o:Events\"></ac:events>\n"
                        "    </m:getEventsResponse>\n"));
}

TEST_F(ServiceReply, WaitIsPassedOnWithItsNumber) {
    const auto reply = service.reply(std::get<http::Request>(http::parse(test::waitNextEvent(56))));
    EXPECT_EQ(std::get<Service::EventAwaited>(reply).lastRetrieved, 56);
}

TEST_F(ServiceReply, UnknownAddressesAreNotFound) {
    EXPECT_EQ(answerTo("GET / HTTP/1.1\n\n").status, 404);
    EXPECT_EQ(answerTo("GET /SOAPService/RaidMonitor HTTP/1.1\n\n").status, 404);
    EXPECT_EQ(answerTo("POST /elsewhere HTTP/1.1\nContent-Length:0\n\n").status, 404);
}

TEST_F(ServiceReply, MalformedCallIsASenderFault) {
    const http::Answer answer = answerTo(test::post("<x"));
    EXPECT_EQ(answer.status, 400);
    EXPECT_EQ(answer.body,
              enveloped("    <env:Fault>\n"
                        "      <env:Code>\n"
                        "        <env:Value>env:Sender</env:Value>\n"
                        "      </env:Code>\n"
                        "      <env:Reason>\n"
                        "        <env:Text xml:lang=\"en\">The request is not well-formed: line 1: "
                        "the tag of \"x\" is not closed</env:Text>\n"
                        "      </env:Reason>\n"
                        "    </env:Fault>\n"));
}

}  // namespace
}  // namespace raidsim
