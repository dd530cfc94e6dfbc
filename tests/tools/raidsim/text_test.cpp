#include "text.h"

#include <gtest/gtest.h>

#include <limits>
#include <string>

namespace raidsim {
namespace {

using namespace std::chrono_literals;

TEST(Text, CountsAreDigitsThatFit) {
    EXPECT_EQ(parseCount("0"), 0U);
    EXPECT_EQ(parseCount("18446744073709551615"), std::numeric_limits<std::uint64_t>::max());
    for (const char* const wrong : {"", "-1", "+1", " 1", "1 ", "1.0", "18446744073709551616"})
        EXPECT_EQ(parseCount(wrong), std::nullopt) << wrong;
}

TEST(Text, SecondsAreWrittenWithoutNeedlessZeros) {
    EXPECT_EQ(formatSeconds(0ms), "0");
    EXPECT_EQ(formatSeconds(10s), "10");
    EXPECT_EQ(formatSeconds(100ms), "0.1");
    EXPECT_EQ(formatSeconds(1002ms), "1.002");
    EXPECT_EQ(formatSeconds(1000000020ms), "1000000.02");
}

TEST(Text, TimesAreWrittenAsTheyAreRead) {
    for (const char* const time :
         {"1970-01-01T00:00:00Z", "2026-11-21T17:48:00Z", "2024-02-29T23:59:59Z",
          "0001-01-01T00:00:00Z", "9999-12-31T23:59:59Z"})
        EXPECT_EQ(formatUtc(parseUtc(time).value()), time);
    EXPECT_EQ(parseUtc("2001-09-09T01:46:40Z")->time_since_epoch(), 1'000'000'000s);
}

TEST(Text, TimesAreOfOneFormAndOnTheCalendar) {
    for (const char* const wrong :
         {"", "2026-11-21", "2026-11-21 17:48:00Z", "2026-11-21T17:48:00", "2026-11-21T17:48:00Zz",
          "2026-1-21T017:48:00Z", "2026-13-21T17:48:00Z", "2026-02-29T17:48:00Z",
          "2026-11-00T17:48:00Z", "2026-11-21T24:00:00Z", "2026-11-21T17:60:00Z",
          "2026-11-21T17:48:60Z", "-026-11-21T17:48:00Z"})
        EXPECT_EQ(parseUtc(wrong), std::nullopt) << wrong;
}

}  // namespace
}  // namespace raidsim
