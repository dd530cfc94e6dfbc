// Places where the log cannot be written, or lies otherwise than usual. The host never notices.

#include <fcntl.h>
#include <gtest/gtest.h>
#include <unistd.h>

#include <array>
#include <cstdint>
#include <filesystem>
#include <fstream>
#include <string>
#include <vector>

#include "../agent/agent_documents.h"
#include "RAIDInstrumentation.h"
#include "diag/debug.h"
#include "ordinary_user.h"
#include "private_mount.h"
#include "support/files.h"
#include "support/fresh_library.h"
#include "support/row.h"
#include "support/scripted_service.h"
#include "support/socket.h"

namespace {

using namespace raid::test;

namespace fs = std::filesystem;

class LogPlace : public FreshLibrary {
protected:
    LogPlace() {
        configRead = 1;
        LOG_LEVEL = 9;
    }

    static void expectTheHostIsServed() {
        const ScriptedService service({answering(systemNamed("served"))});
        RAIDinit();
        EXPECT_EQ(currentSystem(), "served");
    }
};

TEST_F(LogPlace, MayBeOnAReadOnlyFileSystem) {
    const PrivateMount logs("../logs", 1 << 20);
    debug(1, "written\n");
    logs.makeReadOnly();
    debug(1, "lost\n");
    expectTheHostIsServed();
    EXPECT_EQ(readLog(), "written\n");
}

TEST_F(LogPlace, MayBeFull) {
    constexpr std::size_t room = 64 * 1024;
    const PrivateMount logs("../logs", room);
    const std::string message(room / 2, 'm');
    std::ofstream("../logs/other") << message;
    debug(1, message.c_str());
    ASSERT_EQ(fs::space("../logs").available, 0U);
    const auto size = fs::file_size(logPath);
    debug(1, message.c_str());
    expectTheHostIsServed();
    EXPECT_EQ(fs::file_size(logPath), size);

    fs::remove("../logs/other");
    debug(1, "kept\n");
    EXPECT_TRUE(readLog().ends_with("mkept\n"));
}

TEST_F(LogPlace, MayHoldMoreThan2GiB) {
    constexpr std::uintmax_t size = (std::uintmax_t{5} << 30U) + 1;
    writeFile(logPath, "first\n");
    fs::resize_file(logPath, size);
    debug(1, "last\n");
    EXPECT_EQ(fs::file_size(logPath), size + 5);
    std::ifstream log{fs::path(logPath), std::ios::binary};
    log.seekg(-6, std::ios::end);
    std::string end(6, '?');
    log.read(end.data(), 6);
    EXPECT_EQ(end, std::string("\0last\n", 6));
    expectTheHostIsServed();
    EXPECT_GT(fs::file_size(logPath), size + 5);
}

TEST_F(LogPlace, MayBeALinkToAFile) {
    writeFile("elsewhere", "before\n");
    fs::create_symlink("../run/elsewhere", logPath);
    debug(1, "after\n");
    EXPECT_EQ(readFile("elsewhere"), "before\nafter\n");
    EXPECT_TRUE(fs::is_symlink(logPath));
}

TEST_F(LogPlace, MayBeALinkToAFileThatIsNotThereYet) {
    fs::create_symlink("../run/elsewhere", logPath);
    debug(1, "first\n");
    EXPECT_EQ(readFile("elsewhere"), "first\n");
}

TEST_F(LogPlace, MayBeALinkToADirectoryOfLogs) {
    fs::remove("../logs");
    fs::create_directory("elsewhere");
    fs::create_directory_symlink("run/elsewhere", "../logs");
    debug(1, "first\n");
    EXPECT_EQ(readFile("elsewhere/RAIDInstrumentation.log"), "first\n");
    // As the next test expects it.
    fs::remove("../logs");
}

// Longer than what a pipe holds.
TEST_F(LogPlace, MayBeAPipeThatNobodyReads) {
    makePipe(logPath);
    debug(1, std::string(200'000, 'm').c_str());
    expectTheHostIsServed();
}

TEST_F(LogPlace, MayBeAPipeThatSomebodyReads) {
    makePipe(logPath);
    const Socket reader(open(std::string(logPath).c_str(), O_RDONLY | O_NONBLOCK | O_CLOEXEC));
    throwIfNegative(reader.get(), "open the pipe");
    debug(1, "read\n");
    std::array<char, 64> buffer{};
    EXPECT_EQ(read(reader.get(), buffer.data(), buffer.size()), 5);
    EXPECT_STREQ(buffer.data(), "read\n");
}

TEST_F(LogPlace, MayBeADeviceThatIsFull) {
    fs::create_symlink("/dev/full", logPath);
    debug(1, "lost\n");
    expectTheHostIsServed();
}

// A place without a log.
struct Place : Row {
    void (*make)();
};

const std::vector<Place> places{
    {"WithoutADirectory", [] { fs::remove("../logs"); }},
    {"WithAFileInThePlaceOfTheDirectory",
     [] {
         fs::remove("../logs");
         writeFile("../logs", "");
     }},
    {"WithADirectoryInThePlaceOfTheLog", [] { fs::create_directory(logPath); }},
    {"WithALinkToItself", [] { fs::create_symlink("RAIDInstrumentation.log", logPath); }},
    {"WithADirectoryOfSomebodyElse",
     [] { fs::permissions("../logs", fs::perms::owner_read | fs::perms::owner_exec); }},
    {"WithALogOfSomebodyElse",
     [] {
         writeFile(logPath, "");
         fs::permissions(logPath, fs::perms::owner_read);
     }},
};

class PlaceWithoutALog : public LogPlace, public testing::WithParamInterface<Place> {};

TEST_P(PlaceWithoutALog, DropsItsMessages) {
    GetParam().make();
    {
        const OrdinaryUser user;
        debug(1, "lost\n");
        expectTheHostIsServed();
    }
    std::error_code none;
    EXPECT_FALSE(fs::is_regular_file(logPath, none) && fs::file_size(logPath) > 0);
}

INSTANTIATE_TEST_SUITE_P(Places, PlaceWithoutALog, testing::ValuesIn(places), nameOfRow);

}  // namespace
