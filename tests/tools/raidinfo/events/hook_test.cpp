#include "events/hook.h"

#include <gtest/gtest.h>

#include <fstream>
#include <sstream>
#include <stop_token>

namespace raidinfo {
namespace {

const std::stop_token never;

TEST(Hook, GetsItsInput) {
    EXPECT_EQ(runHook("cat >copy", "one line\n", never), "");
    std::ostringstream copy;
    copy << std::ifstream{"copy"}.rdbuf();
    EXPECT_EQ(copy.str(), "one line\n");
    std::remove("copy");
}

TEST(Hook, NeedNotReadItsInput) {
    EXPECT_EQ(runHook("true", std::string(1'000'000, 'x'), never), "");
}

TEST(Hook, TellsHowItFailed) {
    EXPECT_EQ(runHook("exit 3", "", never), "ended with status 3");
    EXPECT_EQ(runHook("kill -KILL $$", "", never), "was ended by signal 9");
}

TEST(Hook, IsToldToEndWhenTheProgramIs) {
    std::stop_source stopped;
    stopped.request_stop();
    EXPECT_EQ(runHook("exec sleep 600", "", stopped.get_token()), "was ended by signal 15");
}

TEST(Hook, IsToldToEndWithAllThatItHasStarted) {
    std::stop_source stopped;
    stopped.request_stop();
    // The shell waits for the other one, whose end it tells.
    EXPECT_EQ(runHook("sh -c 'exec sleep 600'; exit 7", "", stopped.get_token()),
              "was ended by signal 15");
}

}  // namespace
}  // namespace raidinfo
