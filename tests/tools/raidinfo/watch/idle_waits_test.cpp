#include "watch/idle_waits.h"

#include <gtest/gtest.h>

namespace raidinfo {
namespace {

TEST(IdleWaits, NeedAPauseOnceTwoInARowBroughtNothing) {
    IdleWaits waits;
    EXPECT_FALSE(waits.needPause());
    waits.ended(true, false);
    EXPECT_FALSE(waits.needPause());
    waits.ended(true, false);
    EXPECT_TRUE(waits.needPause());
    waits.ended(true, false);
    EXPECT_TRUE(waits.needPause());
}

TEST(IdleWaits, AreForgottenAtNewsAndAtTheEndOfAnInterval) {
    IdleWaits waits;
    waits.ended(true, false);
    waits.ended(true, true);
    waits.ended(true, false);
    EXPECT_FALSE(waits.needPause());
    waits.ended(false, false);
    waits.ended(true, false);
    EXPECT_FALSE(waits.needPause());
}

}  // namespace
}  // namespace raidinfo
