// The debug log and its level.

#include "diag/debug.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <string>
#include <vector>

#include "RAIDInstrumentation.h"
#include "support/files.h"
#include "support/fresh_library.h"

namespace {

using namespace raid::test;

namespace fs = std::filesystem;

class DebugLog : public FreshLibrary {
protected:
    static void settings(std::string_view text) { writeFile(settingsPath, text); }

    // The level that the first message takes from the settings.
    static int levelAfterFirstMessage() {
        debug(100, "not written");
        EXPECT_EQ(configRead, 1);
        return LOG_LEVEL;
    }
};

TEST_F(DebugLog, WritesNothingWithoutSettings) {
    for (const int level : {1, 8, 9}) {
        debug(level, "message\n");
    }
    EXPECT_EQ(LOG_LEVEL, 0);
    EXPECT_FALSE(fs::exists(logPath));
}

TEST_F(DebugLog, WritesLevel8And1ButNot9AtLevel8) {
    writeLogLevel(8);
    debug(9, "nine\n");
    debug(8, "eight\n");
    debug(1, "one\n");
    EXPECT_EQ(readLog(), "eight\none\n");
}

TEST_F(DebugLog, WritesNothingAtANegativeLevel) {
    writeLogLevel(-1);
    debug(1, "one\n");
    debug(0, "zero\n");
    EXPECT_EQ(LOG_LEVEL, -1);
    EXPECT_FALSE(fs::exists(logPath));
}

TEST_F(DebugLog, AddsNothingToItsMessages) {
    writeLogLevel(9);
    debug(9, "a");
    debug(9, "");
    debug(9, "b\n");
    EXPECT_EQ(readLog(), "ab\n");
}

TEST_F(DebugLog, TakesTheLevelByItsLeadingDigits) {
    settings("LogLevel=9abc\n");
    EXPECT_EQ(levelAfterFirstMessage(), 9);
}

TEST_F(DebugLog, TakesALevelOfLettersAsNone) {
    settings("LogLevel=abc\n");
    EXPECT_EQ(levelAfterFirstMessage(), 0);
}

TEST_F(DebugLog, ReadsItsSettingsOnceInAProcess) {
    writeLogLevel(1);
    EXPECT_EQ(levelAfterFirstMessage(), 1);
    writeLogLevel(9);
    EXPECT_EQ(levelAfterFirstMessage(), 1);
    fs::remove(settingsPath);
    debug(1, "one\n");
    EXPECT_EQ(readLog(), "one\n");
}

TEST_F(DebugLog, DoesNotTryAgainWhenItCouldNotReadItsSettings) {
    EXPECT_EQ(levelAfterFirstMessage(), 0);
    writeLogLevel(9);
    EXPECT_EQ(levelAfterFirstMessage(), 0);
}

TEST_F(DebugLog, StaysAtLevel0WithSettingsThatCannotBeRead) {
    const auto expectLevel0 = [] {
        configRead = 0;
        EXPECT_EQ(levelAfterFirstMessage(), 0);
    };
    settings("Level=9\n");
    expectLevel0();
    settings("LogLevel=9\n" + std::string(1024 * 1024, '#'));
    expectLevel0();
    fs::remove(settingsPath);
    fs::create_directory(settingsPath);
    expectLevel0();
    fs::remove(settingsPath);
    makePipe(settingsPath);
    expectLevel0();
}

TEST_F(DebugLog, DropsMessagesWhenItCannotBeOpened) {
    writeLogLevel(9);
    EXPECT_EQ(levelAfterFirstMessage(), 9);
    fs::remove_all("../logs");
    debug(9, "lost\n");
    fs::create_directory("../logs");
    debug(9, "kept\n");
    EXPECT_EQ(readLog(), "kept\n");
}

TEST_F(DebugLog, IsOpenedAnewForEveryMessage) {
    writeLogLevel(9);
    debug(9, "old\n");
    fs::rename(logPath, "../logs/moved.log");
    debug(9, "new\n");
    EXPECT_EQ(readLog(), "new\n");
    EXPECT_EQ(readFile("../logs/moved.log"), "old\n");
}

struct Format {
    std::string message;
    std::string written;
};

TEST_F(DebugLog, ExpandsConversionsWithZeros) {
    const std::vector<Format> formats{
        {"%d", "0"},
        {"a %d b %i %u %x\n", "a 0 b 0 0 0\n"},
        {"%%", "%"},
        {"100%% %%d", "100% %d"},
        {"%5%|", "%|"},
        {"[%5d]", "[    0]"},
        {"[%-5d]", "[0    ]"},
        {"[%05d]", "[00000]"},
        {"[%+.3d]", "[+000]"},
        {"%lld %hhd %zu %jd", "0 0 0 0"},
        {"%f %.1f %g", "0.000000 0.0 0"},
        {"%255d", std::string(254, ' ') + "0"},
        {"[%c]", std::string("[\0]", 3)},
    };
    for (const auto& format : formats) {
        fs::remove(logPath);
        LOG_LEVEL = 1;
        configRead = 1;
        debug(1, format.message.c_str());
        EXPECT_EQ(readLog(), format.written) << format.message;
    }
}

TEST_F(DebugLog, LeavesConversionsThatCouldTouchMemoryAsTheyStand) {
    for (const std::string message :
         {"%s",  "%n",   "%hhn", "%5s", "%.3s",  "%ls",    "%100$s",      "%1$d",
          "%*d", "%.*d", "%m",   "%p",  "%256d", "%.256f", "%999999999d", "%99999999999999999999d",
          "%",   "100%", "%-5",  "%l",  "%y",    "% \n",   "%\n"}) {
        fs::remove(logPath);
        LOG_LEVEL = 1;
        configRead = 1;
        debug(1, message.c_str());
        EXPECT_EQ(readLog(), message);
    }
}

// A conversion spelled at great length once overran the buffer that its format was copied to.
TEST_F(DebugLog, ExpandsAConversionHoweverLongItIsSpelled) {
    for (const std::size_t size : {1U, 15U, 16U, 17U, 19U, 20U, 40U, 4000U, 100000U}) {
        const std::vector<Format> formats{
            {"%" + std::string(size, '-') + "3d|", "0  |"},
            {"%" + std::string(size, '0') + "5d", "00000"},
            {"%." + std::string(size, '0') + "2d", "00"},
            {"%" + std::string(size, 'l') + "d", "0"},
        };
        for (const auto& format : formats) {
            fs::remove(logPath);
            LOG_LEVEL = 1;
            configRead = 1;
            debug(1, format.message.c_str());
            EXPECT_EQ(readLog(), format.written) << format.message.substr(0, 20) << size;
        }
    }
}

}  // namespace
