#include "events/state_file.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <set>
#include <string>

#include "exit_status.h"
#include "support/files.h"

namespace raidinfo {
namespace {

namespace fs = std::filesystem;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

std::set<std::string> filesHere() {
    std::set<std::string> names;
    for (const fs::directory_entry& entry : fs::directory_iterator{"."}) {
        names.insert(entry.path().filename());
    }
    return names;
}

void expectBadInput(const std::string& content) {
    std::ofstream{"state"} << content;
    try {
        static_cast<void>(StateFile{"state"}.read());
        FAIL() << content;
    } catch (const Failure& failure) {
        EXPECT_EQ(failure.status(), ExitStatus::badInput);
        EXPECT_THAT(failure.what(), HasSubstr("state"));
    }
    fs::remove("state");
}

TEST(StateFile, IsEmptyBeforeItIsWritten) { EXPECT_EQ(StateFile{"state"}.read(), std::nullopt); }

TEST(StateFile, KeepsTheNumberAndTheContent) {
    const StateFile state{"state"};
    state.write({41});
    EXPECT_EQ(StateFile{"state"}.read(), LastShown{41});
    state.write({2147483647, 0xFEDCBA9876543210U});
    EXPECT_EQ(StateFile{"state"}.read(), (LastShown{2147483647, 0xFEDCBA9876543210U}));
    EXPECT_THAT(filesHere(), ElementsAre("state"));
}

TEST(StateFile, IsNotTakenForANumberWhenItHoldsSomethingElse) {
    for (const char* const content :
         {"", "12", "12 \n", "x\n", "-1\n", "1 g\n", "1 2 3\n", "1 11112222333344445\n",
          "2147483648\n", "99999999999999999999\n"}) {
        expectBadInput(content);
    }
}

TEST(StateFile, IsTriedWithoutATrace) {
    StateFile{"state"}.tryToWrite();
    EXPECT_THAT(filesHere(), IsEmpty());
    EXPECT_THROW(StateFile{"nowhere/state"}.tryToWrite(), Failure);
}

TEST(StateFile, IsTriedWhereALinkLeadsToAndTheLinkStays) {
    fs::create_symlink("target", "state");
    StateFile{"state"}.tryToWrite();
    EXPECT_THAT(filesHere(), ElementsAre("state"));
    EXPECT_EQ(fs::read_symlink("state"), "target");
    fs::create_symlink("nowhere/target", "astray");
    EXPECT_THROW(StateFile{"astray"}.tryToWrite(), Failure);
    EXPECT_TRUE(fs::is_symlink("astray"));
}

TEST(StateFile, IsWrittenWhereALinkLeadsToAndTheLinkStays) {
    raid::test::writeFile("target", "1\n");
    fs::create_symlink("target", "state");
    StateFile{"state"}.write({2});
    EXPECT_EQ(fs::read_symlink("state"), "target");
    EXPECT_EQ(raid::test::readFile("target"), "2\n");
}

TEST(StateFile, SaysThatItCannotBeWritten) {
    try {
        StateFile{"nowhere/state"}.write({1});
        FAIL();
    } catch (const Failure& failure) {
        EXPECT_EQ(failure.status(), ExitStatus::cannotCreate);
        EXPECT_THAT(failure.what(), HasSubstr("No such file"));
    }
}

}  // namespace
}  // namespace raidinfo
