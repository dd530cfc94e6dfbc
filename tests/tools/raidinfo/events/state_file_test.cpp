#include "events/state_file.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>

#include "exit_status.h"

namespace raidinfo {
namespace {

using testing::HasSubstr;

void expectBadInput(const std::string& content) {
    std::ofstream{"state"} << content;
    try {
        static_cast<void>(StateFile{"state"}.read());
        FAIL() << content;
    } catch (const Failure& failure) {
        EXPECT_EQ(failure.status(), ExitStatus::badInput);
        EXPECT_THAT(failure.what(), HasSubstr("state"));
    }
    std::filesystem::remove("state");
}

TEST(StateFile, IsEmptyBeforeItIsWritten) { EXPECT_EQ(StateFile{"state"}.read(), std::nullopt); }

TEST(StateFile, KeepsTheNumberAndTheContent) {
    const StateFile state{"state"};
    state.write({41});
    EXPECT_EQ(StateFile{"state"}.read(), LastShown{41});
    state.write({2147483647, 0xFEDCBA9876543210U});
    EXPECT_EQ(StateFile{"state"}.read(), (LastShown{2147483647, 0xFEDCBA9876543210U}));
    EXPECT_FALSE(std::filesystem::exists("state.new"));
    std::filesystem::remove("state");
}

TEST(StateFile, IsNotTakenForANumberWhenItHoldsSomethingElse) {
    for (const char* const content : {"", "12", "12 \n", "x\n", "-1\n", "1 g\n", "1 2 3\n",
                                      "1 11112222333344445\n", "99999999999999999999\n"}) {
        expectBadInput(content);
    }
}

TEST(StateFile, IsTriedWithoutATrace) {
    StateFile{"state"}.tryToWrite();
    EXPECT_FALSE(std::filesystem::exists("state"));
    EXPECT_THROW(StateFile{"nowhere/state"}.tryToWrite(), Failure);
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
