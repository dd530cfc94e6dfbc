#include "recording/recording.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace recording {

bool operator==(const Entry& left, const Entry& right) {
    return left.at == right.at && left.question == right.question && left.body == right.body;
}

namespace {

using namespace std::chrono_literals;
using namespace std::string_literals;
using testing::AnyOf;
using testing::ElementsAre;
using testing::ElementsAreArray;
using testing::IsEmpty;
using testing::StartsWith;

const std::string start = "raid-recording 1 2026-11-21T17:48:00Z\n";

std::vector<Entry> someEntries() {
    return {{0ms, Question::configuration, "<a/>"},
            {12ms, Question::newestEvent, ""},
            {12ms, Question::events, std::nullopt},
            {3204ms, Question::events, "line\nline\n"}};
}

std::string fileOf(const std::vector<Entry>& entries) {
    std::string text = heading("2026-11-21T17:48:00Z");
    for (const Entry& entry : entries)
        text += written(entry);
    return text;
}

std::string errorOf(std::string_view text) {
    try {
        (void)parse(text);
    } catch (const RecordingError& error) {
        return error.what();
    }
    return "none";
}

TEST(Recording, IsWrittenAsDocumented) {
    EXPECT_EQ(fileOf(someEntries()), start +
                                         "answer 0 configuration 4\n<a/>\n"
                                         "answer 12 newest-event 0\n\n"
                                         "failure 12 events\n"
                                         "answer 3204 events 10\nline\nline\n\n");
}

TEST(Recording, IsReadAsItWasWritten) {
    const Recording recording = parse(fileOf(someEntries()));
    EXPECT_EQ(recording.startedAt, "2026-11-21T17:48:00Z");
    EXPECT_THAT(recording.entries, ElementsAreArray(someEntries()));
    EXPECT_FALSE(recording.cutShort);
}

TEST(Recording, WithoutEntriesIsEmpty) {
    const Recording recording = parse(start);
    EXPECT_THAT(recording.entries, IsEmpty());
    EXPECT_FALSE(recording.cutShort);
}

TEST(Recording, KeepsABodyOfAnyBytes) {
    std::string bytes = "answer 0 events 1\nx\nfailure 0 events\n";
    for (int byte = 0; byte < 256; ++byte)
        bytes += static_cast<char>(byte);
    bytes += start;
    const Entry entry{0ms, Question::configuration, bytes};
    EXPECT_THAT(parse(start + written(entry)).entries, ElementsAre(entry));
}

TEST(Recording, KeepsALargeBody) {
    const Entry entry{1h, Question::events, std::string(10'000'000, '\n')};
    EXPECT_THAT(parse(start + written(entry)).entries, ElementsAre(entry));
}

TEST(Recording, PassesOverALastEntryThatIsCutAnywhere) {
    const std::vector<Entry> whole{{0ms, Question::events, "first"}};
    for (const Entry& last : std::vector<Entry>{{7ms, Question::configuration, "last\n"},
                                                {7ms, Question::newestEvent, std::nullopt}}) {
        const std::string before = fileOf(whole);
        const std::string cut = written(last);
        for (std::size_t kept = 1; kept < cut.size(); ++kept) {
            const Recording recording = parse(before + cut.substr(0, kept));
            EXPECT_THAT(recording.entries, ElementsAreArray(whole)) << kept;
            EXPECT_TRUE(recording.cutShort) << kept;
        }
    }
}

TEST(Recording, TakesALengthThatTheFileDoesNotHoldForACut) {
    for (const char* const length : {"1", "4294967296", "9223372036854775807"}) {
        const Recording recording = parse(start + "answer 0 events " + length + "\n");
        EXPECT_THAT(recording.entries, IsEmpty()) << length;
        EXPECT_TRUE(recording.cutShort) << length;
    }
}

TEST(Recording, MayLastForAges) {
    const Entry entry{std::chrono::milliseconds::max(), Question::events, std::nullopt};
    EXPECT_THAT(parse(start + written(entry)).entries, ElementsAre(entry));
}

TEST(Recording, IsKnownByItsFirstWord) {
    EXPECT_TRUE(isNamedRecording(start));
    EXPECT_TRUE(isNamedRecording("raid-recording 2"));
    EXPECT_TRUE(isNamedRecording("raid-recording\n"));
    for (const char* const other : {"", "\n", "raid-recordings 1\n", " raid-recording 1\n", "{}"})
        EXPECT_FALSE(isNamedRecording(other)) << other;
}

struct Malformation {
    std::string text;
    std::string message;
};

TEST(Recording, NamesTheByteOfEveryMalformation) {
    const std::string noHeading =
        "byte 0: a recording begins with a line such as "
        "\"raid-recording 1 2026-11-21T17:48:00Z\"";
    const std::vector<Malformation> headings{
        {"", noHeading},
        {"<?xml version=\"1.0\"?>\n", noHeading},
        {"raid-recording 1 2026-11-21T17:48:00Z", noHeading},
        {"raid-recordings 1 2026-11-21T17:48:00Z\n", noHeading},
        {"raid-recording 2 2026-11-21T17:48:00Z\n", "byte 15: version \"2\" is not known"},
        {"raid-recording\n", "byte 14: version \"\" is not known"},
        {"raid-recording 1\n", "byte 16: \"\" is not a time such as 2026-11-21T17:48:00Z"},
        {"raid-recording 1 2026-11-21 17:48:00Z\n",
         "byte 17: \"2026-11-21\" is not a time such as 2026-11-21T17:48:00Z"},
        {"raid-recording 1 2026-11-21T17:48:0xZ\n",
         "byte 17: \"2026-11-21T17:48:0xZ\" is not a time such as 2026-11-21T17:48:00Z"},
        {"raid-recording 1 2026-11-21T17:48:00Z\r\n",
         "byte 17: \"2026-11-21T17:48:00Z?\" is not a time such as 2026-11-21T17:48:00Z"},
        {"raid-recording 1 2026-11-21T17:48:00Z now\n", "byte 38: the line does not end there"},
    };
    for (const auto& [text, message] : headings)
        EXPECT_EQ(errorOf(text), message);

    // Behind the 38 bytes of the first line.
    const std::vector<Malformation> entries{
        {"\n", "byte 38: the start of an entry is missing"},
        {"reply 0 events 1\nx\n", "byte 38: \"reply\" is not the start of an entry"},
        {"reply", "byte 38: \"reply\" is not the start of an entry"},
        {"\x01\xFF\n", "byte 38: \"??\" is not the start of an entry"},
        {std::string(50, 'x') + "\n",
         "byte 38: \"" + std::string(40, 'x') + "...\" is not the start of an entry"},
        {"answer\n", "byte 44: a time in milliseconds is missing"},
        {"answer  0 events 1\nx\n", "byte 45: a time in milliseconds is missing"},
        {"answer -1 events 1\nx\n", "byte 45: \"-1\" is not a time in milliseconds"},
        {"answer 1.5 events 1\nx\n", "byte 45: \"1.5\" is not a time in milliseconds"},
        {"answer 1s", "byte 45: \"1s\" is not a time in milliseconds"},
        {"answer 9223372036854775808 events 1\nx\n",
         "byte 45: \"9223372036854775808\" is too large for a time in milliseconds"},
        {"answer 0\n", "byte 46: a question is missing"},
        {"answer 0 event 1\nx\n", "byte 47: \"event\" is not a question"},
        {"answer 0 Events 1\nx\n", "byte 47: \"Events\" is not a question"},
        {"answer 0 eventful", "byte 47: \"eventful\" is not a question"},
        {"answer 0 events\n", "byte 53: a length is missing"},
        {"answer 0 events 0x1\nx\n", "byte 54: \"0x1\" is not a length"},
        {"answer 0 events +1\nx\n", "byte 54: \"+1\" is not a length"},
        {"answer 0 events 1\r\nx\n", "byte 54: \"1?\" is not a length"},
        {"answer 0 events 18446744073709551617\nx\n",
         "byte 54: \"18446744073709551617\" is too large for a length"},
        {"answer 0 events 99999999999999999999",
         "byte 54: \"99999999999999999999\" is too large for a length"},
        {"answer 0 events 1 2\nx\n", "byte 56: the line does not end there"},
        {"answer 0 events 1 ", "byte 56: the line does not end there"},
        {"answer 0 events 1\nxy\n", "byte 57: no line feed behind a body of 1 bytes"},
        {"failure 0 events 1\nx\n", "byte 55: the line does not end there"},
        {"failure 5 events\nfailure 4 events\n", "byte 55: the entry lies before the one above it"},
    };
    for (const auto& [text, message] : entries)
        EXPECT_EQ(errorOf(start + text), message);
}

TEST(Recording, WithAnyByteChangedIsReadOrRefusedWithTheByte) {
    const std::string whole = fileOf(someEntries());
    for (std::size_t at = 0; at < whole.size(); ++at) {
        for (int byte = 0; byte < 256; ++byte) {
            std::string changed = whole;
            changed[at] = static_cast<char>(byte);
            EXPECT_THAT(errorOf(changed), AnyOf("none"s, StartsWith("byte ")));
        }
    }
}

}  // namespace
}  // namespace recording
