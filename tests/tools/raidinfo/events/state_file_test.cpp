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

TEST(StateFile, KeepsTheNumber) {
    const StateFile state{"state"};
    state.write(41);
    state.write(2147483647);
    EXPECT_EQ(StateFile{"state"}.read(), 2147483647);
    EXPECT_FALSE(std::filesystem::exists("state.new"));
    std::filesystem::remove("state");
}

TEST(StateFile, IsNotTakenForANumberWhenItHoldsSomethingElse) {
    for (const char* const content : {"", "12", "12 \n", "x\n", "-1\n", "99999999999999999999\n"}) {
        expectBadInput(content);
    }
}

TEST(StateFile, SaysThatItCannotBeWritten) {
    try {
        StateFile{"nowhere/state"}.write(1);
        FAIL();
    } catch (const Failure& failure) {
        EXPECT_EQ(failure.status(), ExitStatus::cannotCreate);
        EXPECT_THAT(failure.what(), HasSubstr("No such file"));
    }
}

}  // namespace
}  // namespace raidinfo
