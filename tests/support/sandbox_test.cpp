#include <gmock/gmock.h>
#include <gtest/gtest-spi.h>
#include <gtest/gtest.h>

#include <filesystem>

#include "support/documents.h"
#include "support/files.h"
#include "support/open_descriptors.h"
#include "support/socket.h"

namespace {

using namespace raid::test;
using testing::EndsWith;
using testing::HasSubstr;
using testing::IsEmpty;

TEST(Sandbox, StartsEveryTestInARunDirectoryBesideALogsDirectory) {
    EXPECT_EQ(std::filesystem::current_path().filename(), "run");
    EXPECT_TRUE(std::filesystem::is_empty("."));
    EXPECT_TRUE(std::filesystem::is_empty("../logs"));
}

TEST(Sandbox, WritesTheSettingsAndReadsTheLogWhereTheLibraryLooks) {
    EXPECT_THAT(readLog(), IsEmpty());
    writeLogLevel(-8);
    EXPECT_EQ(readFile("../logs/RAIDInstrumentation.ini"), "LogLevel=-8\n");
    writeFile("../logs/RAIDInstrumentation.log", "one\ntwo");
    EXPECT_EQ(readLog(), "one\ntwo");
}

TEST(Sandbox, SaysWhichFileCannotBeRead) {
    EXPECT_THROW((void)readFile("no such file"), std::runtime_error);
}

TEST(Sandbox, AcceptsADescriptorLeftOpenWhenTheTestSaysSo) {
    static Socket left = Socket::tcp();
    EXPECT_GE(left.get(), 0);
    expectOpenDescriptors(1);
}

TEST(Sandbox, FailsATestThatLeavesADescriptorOpen) {
    const testing::TestInfo& info = *testing::UnitTest::GetInstance()->current_test_info();
    OpenDescriptorCheck check;
    check.OnTestStart(info);
    const Socket left = Socket::tcp();
    EXPECT_NONFATAL_FAILURE(check.OnTestEnd(info), "socket:[");
}

TEST(Documents, AnswerAnnouncesTheBodyWithBareLineFeeds) {
    EXPECT_THAT(answer("12345"), HasSubstr("\nContent-Length: 5\n\n12345"));
    EXPECT_THAT(answer("12345"), Not(HasSubstr("\r")));
}

TEST(Documents, PutTheirContentRightInsideTheResponseElement) {
    EXPECT_THAT(
        configDocument("<ac:system></ac:system>"),
        EndsWith("><ac:system></ac:system></m:getConfigResponse></env:Body></env:Envelope>"));
    EXPECT_THAT(
        eventsDocument("<ac:events></ac:events>"),
        EndsWith("><ac:events></ac:events></m:getEventsResponse></env:Body></env:Envelope>"));
    EXPECT_THAT(newestEventDocument("17"), HasSubstr(">17</as:return></m:getNewestEventResponse>"));
}

}  // namespace
