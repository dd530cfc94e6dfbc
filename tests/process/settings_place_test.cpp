// What can lie where the settings file is expected.

#include <gtest/gtest.h>

#include <filesystem>
#include <string>
#include <vector>

#include "RAIDInstrumentation.h"
#include "diag/debug.h"
#include "ordinary_user.h"
#include "support/files.h"
#include "support/fresh_library.h"
#include "support/row.h"

namespace {

using namespace raid::test;

namespace fs = std::filesystem;

std::string everyByte() {
    std::string bytes;
    for (int byte = 0; byte < 256; ++byte) {
        bytes += static_cast<char>(byte);
    }
    return bytes;
}

struct Settings : Row {
    void (*make)();
    int level;
};

const std::vector<Settings> settings{
    {"Missing", [] {}, 0},
    {"Empty", [] { writeFile(settingsPath, ""); }, 0},
    {"OneByte", [] { writeFile(settingsPath, "="); }, 0},
    {"OneGigabyteOfNothing",
     [] {
         writeFile(settingsPath, "LogLevel=9\n");
         fs::resize_file(settingsPath, std::uintmax_t{1} << 30U);
     },
     0},
    {"Binary", [] { writeFile(settingsPath, everyByte() + everyByte()); }, 0},
    {"BinaryAroundTheSetting",
     [] { writeFile(settingsPath, everyByte() + "\nLogLevel=9\n" + everyByte()); }, 9},
    {"BinaryBehindTheNumber", [] { writeFile(settingsPath, "LogLevel=8" + everyByte()); }, 8},
    {"OneLineWithoutAnEnd", [] { writeFile(settingsPath, std::string(1024 * 1024, 'L')); }, 0},
    {"ADevice", [] { fs::create_symlink("/dev/zero", settingsPath); }, 0},
    {"ALinkToItself", [] { fs::create_symlink("RAIDInstrumentation.ini", settingsPath); }, 0},
    {"ALinkToTheSettings",
     [] {
         writeFile("elsewhere", "LogLevel=9\n");
         fs::create_symlink("../run/elsewhere", settingsPath);
     },
     9},
    {"Unreadable",
     [] {
         writeLogLevel(9);
         fs::permissions(settingsPath, fs::perms::none);
     },
     0},
    {"InADirectoryOfSomebodyElse",
     [] {
         writeLogLevel(9);
         fs::permissions("../logs", fs::perms::none);
     },
     0},
    {"WithoutADirectory", [] { fs::remove("../logs"); }, 0},
};

class SettingsPlace : public FreshLibrary, public testing::WithParamInterface<Settings> {};

TEST_P(SettingsPlace, GivesTheLevelWithoutTroubleForTheHost) {
    GetParam().make();
    {
        const OrdinaryUser user;
        debug(100, "not written\n");
    }
    if (fs::exists("../logs")) {
        fs::permissions("../logs", fs::perms::owner_all);
    }
    EXPECT_EQ(LOG_LEVEL, GetParam().level);
    EXPECT_EQ(configRead, 1);
    EXPECT_FALSE(fs::exists(logPath));
}

INSTANTIATE_TEST_SUITE_P(Files, SettingsPlace, testing::ValuesIn(settings), nameOfRow);

}  // namespace
