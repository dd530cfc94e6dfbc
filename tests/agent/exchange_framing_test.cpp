// How the body is found in an answer: its length, the header's end, what came with the header.

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <malloc.h>

#include <string>
#include <vector>

#include "exchanged.h"
#include "support/fresh_library.h"
#include "support/row.h"
#include "support/scripted_service.h"

namespace {

using namespace raid::test;

struct Framing : Row {
    std::vector<Piece> answer;
    std::optional<std::string> body;
};

std::string header(const std::string& length) {
    return "HTTP/1.1 200 OK\nContent-Length: " + length + "\n\n";
}

const std::string longBody(5000, 'b');
// Its first receive is full to the last byte and ends before the header does.
const std::string longHeader = "Content-Length: 4\n" + std::string(3100, 'h') + "\n\nbody";
const std::string lateLength = std::string(3023, 'h') + "\nContent-Length: 4\n\nbody";

const std::vector<Framing> framings{
    {"InTheFirstChunk", {header("4") + "body"}, "body"},
    {"BehindTheFirstChunk", {header("4"), "body"}, "body"},
    {"InSeveralChunks", {header("8") + "bo", "dy", "bo", "dy"}, "bodybody"},
    {"LongerThanTheFirstChunk", {header("5000") + longBody}, longBody},
    {"OfLengthZero", {header("0")}, ""},
    {"OfLengthZeroWithBytesBehindIt", {header("0") + "body"}, ""},
    {"OfNineDigits", {header("000000004") + "body"}, "body"},
    {"OfTenDigits", {header("1234567890") + "body"}, ""},
    {"OfTenDigitsThatNameASmallNumber", {header("0000000004") + "body"}, ""},
    {"OfTwentyDigits", {header("12345678901234567890") + "body"}, ""},
    {"OfBlankLength", {header("") + "body"}, ""},
    {"OfLengthBehindAnotherBlank", {header(" 4") + "body"}, ""},
    {"OfNegativeLength", {header("-4") + "body"}, ""},
    {"OfPositiveSignedLength", {header("+4") + "body"}, ""},
    {"OfLengthWithLettersBehindIt", {header("4x9") + "body"}, "body"},
    {"LongerThanAnnounced", {header("3") + "body"}, "bod"},
    {"LongerThanAnnouncedInLaterChunks", {header("3"), "body"}, "bod"},
    {"ShorterThanAnnounced", {header("9") + "body"}, "body"},
    {"ShorterThanAnnouncedInLaterChunks", {header("9") + "bo", "dy"}, "body"},
    {"EndedByTheServiceAtOnce", {header("9")}, ""},
    {"WithAZeroByteInIt", {header("4") + std::string("b\0dy", 4)}, "b"},
    {"BehindAHeaderOfCrLfLines", {"A\r\nContent-Length: 4\r\n\r\nbody"}, ""},
    {"BehindAMixedHeader", {"A\r\nContent-Length: 4\r\n\nbody"}, "body"},
    {"WithoutAHeaderEnd", {"Content-Length: 4\nbody"}, ""},
    {"WithTheHeaderEndInTheNextChunk", {"Content-Length: 4\n", "\nbody"}, ""},
    {"BehindAnEarlierHeaderEnd", {"A\n\nContent-Length: 4\n\nbody"}, "Cont"},
    {"OfTheFirstOfTwoLengths", {"Content-Length: 2\n" + header("4") + "body"}, "bo"},
    {"WithoutALength", {"HTTP/1.1 200 OK\n\nbody"}, std::nullopt},
    {"OfALowerCaseLength", {"content-length: 4\n\nbody"}, std::nullopt},
    {"OfALengthWithoutItsBlank", {"Content-Length:4\n\nbody"}, std::nullopt},
    {"WithoutAHeader", {"body"}, std::nullopt},
    {"OfNothingAtAll", {}, std::nullopt},
    {"BehindAHeaderLongerThanTheFirstChunk", {longHeader}, ""},
    {"OfALengthBehindTheFirstChunk", {lateLength}, std::nullopt},
};

class ExchangeFraming : public FreshLibrary, public testing::WithParamInterface<Framing> {};

TEST_P(ExchangeFraming, ReturnsTheBody) {
    const ScriptedService service({{.pieces = GetParam().answer}});
    EXPECT_EQ(exchanged(), GetParam().body);
}

INSTANTIATE_TEST_SUITE_P(Answers, ExchangeFraming, testing::ValuesIn(framings), nameOfRow);

class Exchange : public FreshLibrary {};

TEST_F(Exchange, EndsTheLengthAtTheFirstByteThatIsNoDigit) {
    for (int byte = 1; byte < 256; ++byte) {
        const char c = static_cast<char>(byte);
        if (c < '0' || c > '9') {
            // A tenth digit would make it no length.
            const ScriptedService service(
                {{.pieces = {header(std::string("000000004") + c) + "body"}}});
            EXPECT_EQ(exchanged(), c == '\n' ? "\nbod" : "body") << byte;
        }
    }
}

TEST_F(Exchange, MakesNoFurtherReceiveWhenTheWholeBodyCameInTheFirstChunk) {
    // The service neither sends more nor closes: another receive would block.
    const ScriptedService service({{.pieces = {answer("body")}, .end = End::hold}});
    EXPECT_EQ(exchanged(), "body");
}

TEST_F(Exchange, LeavesTenBytesOfRoomBehindTheBody) {
    for (const std::string body : {"", "body"}) {
        const ScriptedService service({answering(body)});
        const raid::agent::Document received(getSOAPData(0));
        ASSERT_NE(received, nullptr);
        EXPECT_GE(malloc_usable_size(received.get()), body.size() + 10);
        EXPECT_EQ(received.get(), body);
    }
}

}  // namespace
