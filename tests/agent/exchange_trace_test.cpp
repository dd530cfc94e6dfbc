// What an exchange sends, prints and logs.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "exchanged.h"
#include "support/blocked_call.h"
#include "support/files.h"
#include "support/fresh_library.h"
#include "support/open_descriptors.h"
#include "support/row.h"
#include "support/scripted_service.h"

namespace {

using namespace raid::test;

constexpr const char* request = "GET /x HTTP/1.1\r\n\r\n";  // 19 bytes

// The descriptor that is opened next.
std::string nextDescriptor() { return std::to_string(Socket::tcp().get()); }

struct Trace : Row {
    std::vector<Piece> answer;
    std::string log;  // from the first receive on
};

const std::string head = "A: 1\nContent-Length: 6\n\n";  // 24 bytes

const std::vector<Trace> traces{
    {"OfABodyInOneChunk",
     {head + "<body>"},
     "Data received 30\n" + head + "<body>" +
         "Content_Length: 6\nremaining data: 0\nReturn from getSOPEData\n"},
    {"OfABodyInThreeChunks",
     {head + "<", "bod", "y>"},
     "Data received 25\n" + head + "<" +
         "Content_Length: 6\nremaining data: 5\nData received 3\nData received 2\n"
         "Return from getSOPEData\n"},
    {"OfABodyThatEndsEarly",
     {head + "<", "bod"},
     "Data received 25\n" + head + "<" +
         "Content_Length: 6\nremaining data: 5\nData received 3\nData received 0\n"
         "Return from getSOPEData\n"},
    {"OfABodyLongerThanAnnounced",
     {head + "<body>!"},
     "Data received 31\n" + head + "<body>!" +
         "Content_Length: 6\nremaining data: -1\nReturn from getSOPEData\n"},
    {"OfTenDigits",
     {"Content-Length: 0000000006\n\n<body>"},
     "Data received 34\nContent-Length: 0000000006\n\n<body>"
     "remaining data: -6\nReturn from getSOPEData\n"},
    {"WithoutAHeaderEnd",
     {"Content-Length: 6\n"},
     "Data received 18\nContent-Length: 6\nContent_Length: 6\nReturn from getSOPEData\n"},
    {"WithoutALength", {"<body>"}, "Data received 6\n<body>Return from getSOPEData\n"},
    {"OfNothing", {}, "Data received 0\nReturn from getSOPEData\n"},
    {"OfConversionsInTheAnswer",
     {"Content-Length: 0\n\n100%% %d %s %n"},
     "Data received 33\nContent-Length: 0\n\n100% 0 %s %n"
     "Content_Length: 0\nremaining data: -14\nReturn from getSOPEData\n"},
};

class ExchangeTrace : public FreshLibrary, public testing::WithParamInterface<Trace> {};

TEST_P(ExchangeTrace, IsTheWholeLogAtLevelEight) {
    writeLogLevel(8);
    const ScriptedService service({{.pieces = GetParam().answer}});
    const std::string start = "RAIDCommunication\nSocket handle=" + nextDescriptor() +
                              "\nConnect rc=0\nSend size=19\n" + request +
                              "Waiting for data\nData are available\n";
    (void)textOf(getSOAPData(request));
    EXPECT_EQ(readLog(), start + GetParam().log);
}

TEST_P(ExchangeTrace, IsOneLineAtLevelOne) {
    writeLogLevel(1);
    const ScriptedService service({{.pieces = GetParam().answer}});
    (void)textOf(getSOAPData(request));
    EXPECT_EQ(readLog(), "Data are available\n");
}

INSTANTIATE_TEST_SUITE_P(Answers, ExchangeTrace, testing::ValuesIn(traces), nameOfRow);

class ExchangeOutput : public FreshLibrary {};

TEST_F(ExchangeOutput, LogsAFailedConnectAndNothingMore) {
    writeLogLevel(8);
    const std::string handle = nextDescriptor();
    EXPECT_EQ(exchanged(), std::nullopt);
    EXPECT_EQ(readLog(), "RAIDCommunication\nSocket handle=" + handle + "\nConnect rc=-1\n");
}

TEST_F(ExchangeOutput, LogsNothingMoreOfACancelledWait) {
    expectOpenDescriptors(1);
    writeLogLevel(8);
    const ScriptedService service({{.end = End::hold}});
    BlockedCall blocked([] { return exchanged(); });
    service.waitFor(0, Stage::requestRead);
    disconnectSocket();
    EXPECT_EQ(blocked.interrupt(), std::nullopt);
    EXPECT_TRUE(readLog().ends_with("Waiting for data\n"));
}

TEST_F(ExchangeOutput, LogsNothingByDefault) {
    const ScriptedService service({answering("body")});
    EXPECT_EQ(exchanged(), "body");
    EXPECT_EQ(readLog(), "");
}

TEST_F(ExchangeOutput, SendsTheRequestWholeWhateverItsLength) {
    const std::string longRequest = "GET /" + std::string(100'000, 'x') + "\r\n\r\n";
    const ScriptedService service({answering("body")});
    EXPECT_EQ(textOf(getSOAPData(longRequest.c_str())), "body");
    EXPECT_EQ(service.request(0), longRequest);
}

struct Printed {
    const char* request;
    const char* line;
};

TEST_F(ExchangeOutput, PrintsOneLineOnStandardOutput) {
    for (const auto& [sent, line] : {Printed{request, "sent size 19, FD isset 1\n"},
                                     Printed{"\n\n", "sent size 2, FD isset 1\n"}}) {
        const ScriptedService service({answering("body")});
        testing::internal::CaptureStdout();
        (void)textOf(getSOAPData(sent));
        EXPECT_EQ(testing::internal::GetCapturedStdout(), line);
    }
}

TEST_F(ExchangeOutput, PrintsNothingWithoutAConnection) {
    testing::internal::CaptureStdout();
    EXPECT_EQ(exchanged(), std::nullopt);
    EXPECT_EQ(testing::internal::GetCapturedStdout(), "");
}

TEST_F(ExchangeOutput, SendsTheStoredRequestsByNumber) {
    const std::string configuration =
        "GET /SOAPService/DataProcessor?getConfig HTTP/1.1 Accept */*\r\n\r\n";
    const std::string eventList =
        "GET /SOAPService/RaidMonitor?getEvents HTTP/1.1 Accept */*\r\n\r\n";
    for (const int which : {0, 1, -1, 7}) {
        const ScriptedService service({answering("body")});
        EXPECT_EQ(textOf(getSOAPData(which)), "body");
        EXPECT_EQ(service.request(0), which == 0 ? configuration : eventList);
    }
}

}  // namespace
