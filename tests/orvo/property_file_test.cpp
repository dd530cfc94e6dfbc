// Reading the settings file.

#include "orvo/property_file.h"

#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <stdexcept>
#include <string>

#include "support/files.h"

namespace {

using namespace raid::test;

constexpr const char* path = "settings.ini";
constexpr int readMode = 3;

// The value of "Key" in a file of this text.
std::string valueIn(const std::string& text) {
    writeFile(path, text);
    Orvo::PropertyFile file{Orvo::File::Path(path)};
    file.open(readMode);
    return Orvo::make_string(file.getValue(Orvo::make_wstring("Key")));
}

TEST(PropertyFile, ReadsALineOfKeyAndValue) {
    EXPECT_EQ(valueIn("Key=value"), "value");
    EXPECT_EQ(valueIn("Other=1\nKey=value\nLast=2\n"), "value");
    EXPECT_EQ(valueIn("Key="), "");
    EXPECT_EQ(valueIn("Key=a=b"), "a=b");
}

TEST(PropertyFile, ToleratesBlanksCommentsSectionsAndForeignLineEnds) {
    EXPECT_EQ(valueIn("  Key \t=  a value \t\n"), "a value");
    EXPECT_EQ(valueIn("# Key=1\n ; Key=2\nKey=3\n#Key=4"), "3");
    EXPECT_EQ(valueIn("[section = x]\nKey=1\n[Key=2]\n"), "1");
    EXPECT_EQ(valueIn("\r\nOther=1\r\nKey=2\r\n"), "2");
    EXPECT_EQ(valueIn("\xEF\xBB\xBFKey=1\n"), "1");
    EXPECT_EQ(valueIn("no equals sign\n\n\nKey=1"), "1");
}

TEST(PropertyFile, LetsTheLastValueOfAKeyHold) { EXPECT_EQ(valueIn("Key=1\nKey=2\n"), "2"); }

TEST(PropertyFile, KeepsBytesThatAreNoCharacters) {
    EXPECT_EQ(valueIn("Key=\xFFx\xC3\n"), "\xFFx\xC3");
}

TEST(PropertyFile, ThrowsForAKeyThatIsNotThere) {
    EXPECT_THROW(valueIn("key=1\nKey2=2\n# Key=3\n"), std::out_of_range);
    EXPECT_THROW(valueIn(""), std::out_of_range);
}

TEST(PropertyFile, ForgetsItsValuesWhenClosed) {
    writeFile(path, "Key=1");
    Orvo::PropertyFile file{Orvo::File::Path(path)};
    file.open(readMode);
    file.close();
    EXPECT_THROW(static_cast<void>(file.getValue(L"Key")), std::out_of_range);
}

void expectUnreadable() {
    Orvo::PropertyFile file{Orvo::File::Path(path)};
    EXPECT_THROW(file.open(readMode), std::runtime_error);
}

TEST(PropertyFile, ThrowsForWhatIsNoReadableFile) {
    expectUnreadable();
    ASSERT_EQ(mkdir(path, 0700), 0);
    expectUnreadable();
    ASSERT_EQ(rmdir(path), 0);
    makePipe(path);
    expectUnreadable();
}

TEST(PropertyFile, ThrowsForAFileOverItsSizeLimit) {
    std::string text = "Key=1\n";
    text.resize(Orvo::PropertyFile::sizeLimit, '#');
    EXPECT_EQ(valueIn(text), "1");
    writeFile(path, text + "#");
    expectUnreadable();
}

}  // namespace
