#include "system/file.h"

#include <fcntl.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <array>
#include <cstdint>
#include <filesystem>
#include <string>

#include "exit_status.h"
#include "support/files.h"
#include "system/descriptor.h"

namespace raidinfo {
namespace {

namespace fs = std::filesystem;
using raid::test::writeFile;
using testing::HasSubstr;

class ReplacedFile : public testing::Test {
protected:
    ReplacedFile() { fs::create_directory(folder); }
    ~ReplacedFile() override { fs::remove_all(folder); }

    [[nodiscard]] std::ptrdiff_t filesInFolder() const {
        return std::distance(fs::directory_iterator{folder}, fs::directory_iterator{});
    }

    const fs::path folder = "replaced";
    const fs::path file = folder / "file";
    const fs::path other = folder / "other";
};

constexpr auto ownersOnly = fs::perms::owner_read | fs::perms::owner_write;

TEST_F(ReplacedFile, HasTheNewContentAndLeavesNothingBeside) {
    replaceFile(file, "first");
    EXPECT_EQ(readFile(file), "first");
    replaceFile(file, "second");
    EXPECT_EQ(readFile(file), "second");
    EXPECT_EQ(filesInFolder(), 1);
}

TEST_F(ReplacedFile, CanBeReadByThoseWhoCouldReadItBefore) {
    writeFile(file, "first");
    const auto everyone = fs::perms::group_write | fs::perms::others_write | ownersOnly;
    for (const fs::perms mode : {ownersOnly, everyone}) {
        fs::permissions(file, mode);
        replaceFile(file, "second");
        EXPECT_EQ(fs::status(file).permissions(), mode);
    }
}

TEST_F(ReplacedFile, CanBeAsLargeAndAsYoungAsTheSystemAllows) {
    writeFile(file, "first");
    fs::permissions(file, ownersOnly);
    fs::resize_file(file, std::uintmax_t{3} << 30U);
    const std::array<timespec, 2> year2040{
        {{.tv_sec = 2'208'988'800, .tv_nsec = 0}, {.tv_sec = 2'208'988'800, .tv_nsec = 0}}};
    ASSERT_EQ(utimensat(AT_FDCWD, file.c_str(), year2040.data(), 0), 0);
    replaceFile(file, "second");
    EXPECT_EQ(readFile(file), "second");
    EXPECT_EQ(fs::status(file).permissions(), ownersOnly);
}

TEST_F(ReplacedFile, IsTheOneThatALinkLeadsTo) {
    writeFile(other, "first");
    fs::permissions(other, ownersOnly);
    fs::create_symlink("other", folder / "link");
    fs::create_symlink("link", file);
    replaceFile(file, "second");
    EXPECT_TRUE(fs::is_symlink(file));
    EXPECT_TRUE(fs::is_symlink(folder / "link"));
    EXPECT_EQ(readFile(other), "second");
    EXPECT_EQ(fs::status(other).permissions(), ownersOnly);
}

TEST_F(ReplacedFile, IsMadeWhereALinkLeadsToNothing) {
    fs::create_symlink("other", file);
    replaceFile(file, "content");
    EXPECT_TRUE(fs::is_symlink(file));
    EXPECT_EQ(readFile(other), "content");
}

TEST_F(ReplacedFile, CannotBeALinkToItself) {
    fs::create_symlink("file", file);
    try {
        replaceFile(file, "content");
        FAIL();
    } catch (const Failure& failure) {
        EXPECT_EQ(failure.status(), ExitStatus::cannotCreate);
        EXPECT_THAT(failure.what(), HasSubstr("symbolic links"));
    }
    EXPECT_TRUE(fs::is_symlink(file));
}

TEST_F(ReplacedFile, LeavesFilesWithLikeNamesAlone) {
    // Of an earlier process with the same number, as it were.
    const fs::path left = folder / ("file." + std::to_string(getpid()) + "-0.new");
    writeFile(other, "other");
    fs::create_symlink("other", left);
    replaceFile(file, "content");
    EXPECT_EQ(readFile(other), "other");
    EXPECT_TRUE(fs::is_symlink(left));
    EXPECT_TRUE(fs::is_regular_file(fs::symlink_status(file)));
    EXPECT_EQ(filesInFolder(), 3);
}

TEST_F(ReplacedFile, IsTriedWithoutATrace) {
    checkReplaceable(file);
    EXPECT_EQ(filesInFolder(), 0);
    writeFile(file, "content");
    checkReplaceable(file);
    EXPECT_EQ(readFile(file), "content");
    EXPECT_EQ(filesInFolder(), 1);
    EXPECT_THROW(checkReplaceable(folder / "nowhere/file"), Failure);
}

TEST_F(ReplacedFile, StaysThePipeThatItIs) {
    raid::test::makePipe(file);
    fs::create_symlink("file", other);
    const Descriptor reader{open(file.c_str(), O_RDWR | O_NONBLOCK), "cannot open the pipe"};
    replaceFile(other, "through the pipe");
    std::array<char, 64> bytes{};
    const ssize_t size = read(reader.get(), bytes.data(), bytes.size());
    ASSERT_GT(size, 0);
    EXPECT_EQ(std::string(bytes.data(), static_cast<std::size_t>(size)), "through the pipe");
    EXPECT_TRUE(fs::is_fifo(file));
    EXPECT_EQ(filesInFolder(), 2);
}

TEST_F(ReplacedFile, IsNoDevice) {
    fs::create_symlink("/dev/null", file);
    replaceFile(file, "content");
    EXPECT_TRUE(fs::is_symlink(file));
    EXPECT_TRUE(fs::is_character_file("/dev/null"));
}

}  // namespace
}  // namespace raidinfo
