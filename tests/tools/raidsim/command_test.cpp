#include "control/command.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

#include "control/words.h"
#include "running_service.h"
#include "support/files.h"

namespace raidsim {
namespace {

using raid::test::writeFile;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::StartsWith;

class CommandLine : public testing::Test {
protected:
    Outcome carryOut(std::string_view line) { return run(line, service); }

    std::string errorOf(std::string_view line) {
        try {
            carryOut(line);
        } catch (const CommandError& error) {
            return error.what();
        }
        return "none";
    }

    Service service = test::makeService(test::smallSystem(), "served.xml");
};

TEST(Words, AreCutAtBlanksOutsideOfQuotes) {
    EXPECT_THAT(splitWords("  event\tstring=\"Drive  failed\" x=\"\"\r"),
                ElementsAre("event", "string=Drive  failed", "x="));
    EXPECT_THAT(splitWords(R"("a \"b\" \\" c\d)"), ElementsAre("a \"b\" \\", "c\\d"));
    EXPECT_THAT(splitWords(" \t"), IsEmpty());
}

TEST(Words, OpenQuotesAndControlCharactersAreErrors) {
    EXPECT_THROW((void)splitWords("a \"b"), CommandError);
    EXPECT_THROW((void)splitWords("a \"b\\"), CommandError);
    EXPECT_THROW((void)splitWords("a\x01"), CommandError);
}

TEST_F(CommandLine, BlankLinesAndCommentsDoNothing) {
    const std::string before = service.document().body();
    for (const char* const line : {"", "  ", "# quit", "  # quit"})
        EXPECT_FALSE(carryOut(line).quit);
    EXPECT_EQ(service.document().body(), before);
}

TEST_F(CommandLine, EventIsAddedWithDateAndServerFilledIn) {
    carryOut("event type=Critical eventCode=101 string=\"Drive failed\" channel=1 deviceID=3");
    EXPECT_THAT(
        service.events().body(1, 1),
        HasSubstr(
            "          <as:sequenceNumber xsi:type=\"xsd:int\">1</as:sequenceNumber>\n"
            "          <as:date xsi:type=\"xsd:string\">2001-09-09T01:46:40Z</as:date>\n"
            "          <as:type xsi:type=\"xsd:string\">Critical</as:type>\n"
            "          <as:eventCode xsi:type=\"xsd:int\">101</as:eventCode>\n"
            "          <as:string xsi:type=\"xsd:string\">Drive failed</as:string>\n"
            "          <as:serverName xsi:type=\"xsd:string\">birch</as:serverName>\n"
            "          <as:serverAddress xsi:type=\"xsd:string\">127.0.0.1</as:serverAddress>\n"
            "          <as:channel xsi:type=\"xsd:int\">1</as:channel>\n"
            "          <as:deviceID xsi:type=\"xsd:int\">3</as:deviceID>\n"));
}

TEST_F(CommandLine, EventsOwnDateAndServerOverride) {
    carryOut("event date=yesterday serverName=oak");
    EXPECT_THAT(service.events().body(1, 1), HasSubstr(">yesterday</as:date>"));
    EXPECT_THAT(service.events().body(1, 1), HasSubstr(">oak</as:serverName>"));
}

TEST_F(CommandLine, SetProgressJoinAndLeaveChangeTheDocument) {
    carryOut("set adapter:1/channel:1/drive:0 state=4");
    EXPECT_THAT(service.document().body(), HasSubstr("<as:state>4</as:state>"));
    carryOut("progress adapter:1/channel:1/drive:0 37");
    EXPECT_THAT(service.document().body(), HasSubstr(">37</as:percentComplete>"));
    carryOut("progress adapter:1/channel:1/drive:0 done");
    const std::string before = service.document().body();
    carryOut("leave channel:2/drive:0 spares");
    EXPECT_NE(service.document().body(), before);
    carryOut("join channel:2/drive:0 spares");
    EXPECT_NE(service.document().body(), before);  // the whole drive is listed now
}

TEST_F(CommandLine, EventWithAPlaceMayHaveAnyNumber) {
    carryOut("event sequenceNumber=5");
    carryOut("event place=last sequenceNumber=5 string=again");
    carryOut("event sequenceNumber=3 place=first");
    carryOut("event place=before:5 sequenceNumber=4");
    carryOut("event place=after:3");
    EXPECT_EQ(service.events().size(), 5U);
    EXPECT_EQ(service.events().newest(), 6);
    EXPECT_EQ(errorOf("event sequenceNumber=6"),
              "event: sequenceNumber 6 is not above the newest, 6");
    EXPECT_EQ(errorOf("event place=before:9 type=x"), "event: there is no event 9");
    for (const std::string wrong : {"", "end", "last:1", "before", "before:", "after:x", ":1"}) {
        EXPECT_EQ(
            errorOf("event place=" + wrong),
            "event: \"" + wrong + "\" is no place: last, first, before:NUMBER or after:NUMBER");
    }
}

TEST_F(CommandLine, ForgetLosesAllEventsOrTheLast) {
    for (int i = 0; i < 5; ++i)
        carryOut("event type=Information");
    EXPECT_EQ(errorOf("forget 6"), "forget: the newest event is 5");
    EXPECT_EQ(errorOf("forget -1"), "forget: \"-1\" is not the number of an event");
    EXPECT_EQ(errorOf("forget all"), "forget: \"all\" is not the number of an event");
    carryOut("forget 3");
    EXPECT_EQ(service.events().newest(), 3);
    carryOut("forget");
    EXPECT_EQ(service.events().newest(), 0);
    EXPECT_EQ(service.events().size(), 0U);
}

TEST_F(CommandLine, AddAndRemovePlugDrives) {
    const std::string before = service.document().body();
    carryOut("add adapter:1/channel:1/drive:4 like channel:2/drive:0 state=0 \"model=R 5\"");
    EXPECT_THAT(service.document().body(), HasSubstr("<as:model>R 5</as:model>"));
    carryOut("remove channel:1/drive:4");
    EXPECT_EQ(service.document().body(), before);
    writeFile("drive.xml", "<ac:hardDrive><as:deviceID/></ac:hardDrive>");
    carryOut("add channel:1/drive:4 from drive.xml deviceID=04");
    EXPECT_THAT(service.document().body(), HasSubstr("<as:deviceID>04</as:deviceID>"));
}

TEST_F(CommandLine, AddSaysWhatIsWrongWithItsModel) {
    EXPECT_EQ(errorOf("add channel:1/drive:4 as drive:0"),
              "add: \"as\" is neither \"like\" nor \"from\"");
    EXPECT_EQ(errorOf("add channel:1/drive:4 from gone.xml"),
              "add: gone.xml: No such file or directory");
    writeFile("fan.xml", "<ac:fan/>");
    EXPECT_EQ(errorOf("add channel:1/drive:4 from fan.xml"),
              "add: fan.xml: the file holds \"ac:fan\" in place of \"ac:hardDrive\"");
    EXPECT_EQ(errorOf("add channel:1/drive:4 like drive:0 state"),
              "add: \"state\" is not of the form field=value");
}

TEST_F(CommandLine, DownAndUpAreToldByStatus) {
    carryOut("down");
    EXPECT_EQ(carryOut("status").message,
              "document served.xml, events 0, newest 0, waiting clients 0, down");
    carryOut("up");
    EXPECT_EQ(carryOut("status").message,
              "document served.xml, events 0, newest 0, waiting clients 0");
}

TEST_F(CommandLine, AdvanceIsForWhoKeepsTheClock) {
    EXPECT_EQ(carryOut("advance 2.5").advance, std::chrono::milliseconds(2500));
    EXPECT_EQ(carryOut("status").advance, std::nullopt);
    EXPECT_EQ(
        errorOf("advance soon"),
        "advance: \"soon\" is not a time of 0 to 1000000 seconds with at most three decimals");
}

TEST_F(CommandLine, ReloadServesTheFileAsItIsNow) {
    writeFile("served.xml", "<ac:system><as:name>oak</as:name></ac:system>");
    EXPECT_EQ(carryOut("reload").message, "serving served.xml");
    EXPECT_THAT(service.document().body(), HasSubstr("<as:name>oak</as:name>"));
}

TEST_F(CommandLine, ReloadOfAnotherFileMakesItTheServedOne) {
    writeFile("other.xml", "<ac:system><as:name>elm</as:name></ac:system>");
    carryOut("reload other.xml");
    EXPECT_EQ(service.documentPath(), "other.xml");
    EXPECT_EQ(carryOut("reload").message, "serving other.xml");
}

TEST_F(CommandLine, ReloadOfAMalformedOrMissingFileKeepsTheOldDocument) {
    const std::string before = service.document().body();
    writeFile("served.xml", "<ac:system>\n<as:name>oak</ac:system>");
    EXPECT_EQ(errorOf("reload"),
              "reload: served.xml: line 2: end tag of \"ac:system\" where \"as:name\" is open; "
              "the old document stays");
    writeFile("served.xml", "<other/>");
    EXPECT_THAT(errorOf("reload"), HasSubstr("there is no ac:system element"));
    EXPECT_THAT(errorOf("reload gone.xml"), StartsWith("reload: gone.xml: No such file"));
    EXPECT_THAT(errorOf("reload ."), HasSubstr("Not a regular file"));
    EXPECT_EQ(service.document().body(), before);
    EXPECT_EQ(service.documentPath(), "served.xml");
}

TEST_F(CommandLine, StatusTellsDocumentEventsAndWaits) {
    carryOut("event type=Information");
    service.events().await(1, [](std::optional<int>) {});
    EXPECT_EQ(carryOut("status").message,
              "document served.xml, events 1, newest 1, waiting clients 1");
}

TEST_F(CommandLine, HelpListsEveryCommandAndQuitQuits) {
    EXPECT_EQ(carryOut("help").message,
              "event [place=last|first|before:N|after:N] field=value...\n"
              "set PATH field=value...\n"
              "progress PATH PERCENT|done\n"
              "join DRIVE-PATH ARRAY-OR-SPARES-PATH\n"
              "leave DRIVE-PATH ARRAY-OR-SPARES-PATH\n"
              "add PATH like PATH | from FILE [field=value...]\n"
              "remove PATH\n"
              "forget [NUMBER]\n"
              "reload [FILE]\n"
              "fault FILE [CASE] | off\n"
              "down\n"
              "up\n"
              "advance SECONDS\n"
              "status\n"
              "help\n"
              "quit");
    EXPECT_FALSE(carryOut("help").quit);
    EXPECT_TRUE(carryOut("quit").quit);
}

TEST_F(CommandLine, ErrorsAreOneLineThatSaysWhatIsWrong) {
    EXPECT_EQ(errorOf("reboot now"), "unknown command \"reboot\"");
    EXPECT_EQ(errorOf("set adapter:1"), "usage: set PATH field=value...");
    EXPECT_EQ(errorOf("quit now"), "usage: quit");
    EXPECT_EQ(errorOf("event"), "usage: event [place=last|first|before:N|after:N] field=value...");
    EXPECT_EQ(errorOf("event color=red"), "event: an event has no field \"color\"");
    EXPECT_EQ(errorOf("event channel=one"),
              "event: \"one\" is no number from -2147483648 to 2147483647");
    EXPECT_EQ(errorOf("set adapter:1 state"), "set: \"state\" is not of the form field=value");
    EXPECT_EQ(errorOf("set adapter:1 =4"), "set: \"=4\" is not of the form field=value");
    EXPECT_EQ(errorOf("set disk:1 a=b"), "set: there is no kind of object \"disk\"");
    EXPECT_EQ(errorOf("set adapter:9 a=b"), "set: the document has no adapter:9");
    EXPECT_EQ(errorOf("set adapter:1 color=red"), "set: adapter:1 has no field \"color\"");
    EXPECT_EQ(errorOf("progress drive:0 101"),
              "progress: \"101\" is neither a percentage nor \"done\"");
    EXPECT_EQ(errorOf("progress array:7 50"), "progress: no task runs on \"array\"");
    EXPECT_EQ(errorOf("event \"x"), "a quote is not closed");
}

}  // namespace
}  // namespace raidsim
