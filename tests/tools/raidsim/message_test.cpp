#include "http/message.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

#include "bounds.h"

namespace raidsim::http {
namespace {

Request wholeOf(std::string_view received) { return std::get<Request>(parse(received)); }
int refusalOf(std::string_view received) { return std::get<Refusal>(parse(received)).status; }
bool isIncomplete(std::string_view received) {
    return std::holds_alternative<Incomplete>(parse(received));
}

TEST(HttpMessage, GetLineMayCarryAHeader) {
    const Request request =
        wholeOf("GET /SOAPService/DataProcessor?getConfig HTTP/1.1 Accept */*\r\n\r\n");
    EXPECT_EQ(request.method, "GET");
    EXPECT_EQ(request.target, "/SOAPService/DataProcessor?getConfig");
    EXPECT_EQ(request.body, "");
}

TEST(HttpMessage, PostMayHaveBareLineFeedsAndNoBlankAfterTheLengthsColon) {
    EXPECT_EQ(wholeOf("POST /p HTTP/1.1\nContent-Type: x\nContent-Length:5\n\nhello").body,
              "hello");
}

TEST(HttpMessage, PostMayHaveCarriageReturnsAndAnyCase) {
    EXPECT_EQ(wholeOf("POST /p HTTP/1.1\r\ncontent-length : 5\r\n\r\nhello").body, "hello");
}

TEST(HttpMessage, BytesBeyondTheLengthAreNotOfTheBody) {
    EXPECT_EQ(wholeOf("POST /p HTTP/1.1\nContent-Length:2\n\nhello").body, "he");
}

TEST(HttpMessage, EveryProperPrefixIsIncomplete) {
    const std::string text = "\r\nPOST /p HTTP/1.1\nContent-Length:5\n\nhello";
    for (std::size_t length = 0; length < text.size(); ++length)
        EXPECT_TRUE(isIncomplete(text.substr(0, length))) << length;
    EXPECT_FALSE(isIncomplete(text));
}

TEST(HttpMessage, MalformedRequestsAreRefusedWithTheirStatus) {
    EXPECT_EQ(refusalOf("nonsense\n\n"), 400);
    EXPECT_EQ(refusalOf("GET /p\n\n"), 400);
    EXPECT_EQ(refusalOf("GET /p FTP/1\n\n"), 400);
    EXPECT_EQ(refusalOf("PUT /p HTTP/1.1\n\n"), 405);
    EXPECT_EQ(refusalOf("POST /p HTTP/1.1\n\n"), 411);
    EXPECT_EQ(refusalOf("POST /p HTTP/1.1\nContent-Length: x\n\n"), 400);
    EXPECT_EQ(refusalOf("POST /p HTTP/1.1\nContent-Length: -1\n\n"), 400);
    EXPECT_EQ(refusalOf("POST /p HTTP/1.1\nContent-Length:\n\n"), 400);
    EXPECT_EQ(refusalOf("POST /p HTTP/1.1\nContent-Length: 99999999999999999999999\n\n"), 413);
    EXPECT_EQ(refusalOf("POST /p HTTP/1.1\nTransfer-Encoding: chunked\n\n"), 501);
}

TEST(HttpMessage, BodyAtTheLimitIsAwaitedAndOneByteMoreIsRefused) {
    const auto announcing = [](std::size_t length) {
        return "POST /p HTTP/1.1\nContent-Length: " + std::to_string(length) + "\n\n";
    };
    EXPECT_TRUE(isIncomplete(announcing(bounds::requestBodyBytes)));
    EXPECT_EQ(refusalOf(announcing(bounds::requestBodyBytes + 1)), 413);
}

TEST(HttpMessage, HeaderAtTheLimitIsAwaitedAndOneByteMoreIsRefused) {
    EXPECT_TRUE(isIncomplete(std::string(bounds::headerBytes, 'x')));
    EXPECT_EQ(refusalOf(std::string(bounds::headerBytes + 1, 'x')), 431);
    EXPECT_EQ(refusalOf(std::string(bounds::headerBytes + 1, 'x') + "\n\n"), 431);
    EXPECT_EQ(refusalOf(std::string(bounds::headerBytes + 1, '\n')), 431);
}

TEST(HttpMessage, AnswerHasBareLineFeedsAndABlankAfterTheLengthsColon) {
    EXPECT_EQ(format({200, "abc"}),
              "HTTP/1.1 200 OK\n"
              "Content-Type: application/soap+xml; charset=\"utf-8\"\n"
              "Content-Length: 3\n"
              "Connection: close\n"
              "\n"
              "abc");
}

TEST(HttpMessage, FaultBlamesTheSenderBelow500) {
    const Answer answer = fault({404, "why <so>"});
    EXPECT_EQ(answer.status, 404);
    EXPECT_THAT(answer.body, testing::HasSubstr("<env:Value>env:Sender</env:Value>"));
    EXPECT_THAT(answer.body,
                testing::HasSubstr("<env:Text xml:lang=\"en\">why &lt;so&gt;</env:Text>"));
    EXPECT_THAT(fault({503, ""}).body, testing::HasSubstr("<env:Value>env:Receiver</env:Value>"));
}

}  // namespace
}  // namespace raidsim::http
