#include "settings/document.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <filesystem>
#include <functional>

#include "exit_status.h"
#include "settings/shipped.h"
#include "settings/table_reader.h"
#include "support/files.h"

namespace raidinfo::settings {
namespace {

using raid::test::writeFile;
using testing::HasSubstr;
using testing::StartsWith;

Failure failureOf(const std::function<void()>& action) {
    try {
        action();
    } catch (const Failure& failure) {
        return failure;
    }
    return {ExitStatus::ok, "no failure"};
}

Failure refusalOf(const std::string& text) {
    return failureOf([&text] { static_cast<void>(parsedDocument(text, "file.toml")); });
}

TEST(Document, KeepsOrderAndLines) {
    const Table table = parsedDocument("b = 1\n\na = [\"x\",\n  true]\n[t]\nc = \"y\"\n", "f");
    ASSERT_EQ(table.size(), 3U);
    EXPECT_EQ(table[0].key, "b");
    EXPECT_EQ(numberOf(table[0].setting), 1);
    EXPECT_EQ(table[1].key, "a");
    EXPECT_EQ(table[1].setting.place.line, 3U);
    EXPECT_EQ(textOf(listOf(table[1].setting)[0]), "x");
    EXPECT_TRUE(flagOf(listOf(table[1].setting)[1]));
    EXPECT_EQ(listOf(table[1].setting)[1].place.line, 4U);
    EXPECT_EQ(table[2].setting.place.line, 5U);
    EXPECT_EQ(textOf(tableOf(table[2].setting)[0].setting), "y");
}

TEST(Document, ThatIsNoTomlIsRefusedWithItsLine) {
    for (const std::string text : {"a = 1\nb =", "a = 1\n[b", "a = 1\n\"", "a = 1\na = 2",
                                   "a = 1\nb = \"\xFF\"", "\n\x01", "\nb = '\x1b'"}) {
        const Failure failure = refusalOf(text);
        EXPECT_EQ(failure.status(), ExitStatus::badInput) << text;
        EXPECT_THAT(failure.what(), StartsWith("file.toml:2: ")) << text;
        EXPECT_EQ(std::string{failure.what()}.find_first_of("\n\x1b\x01"), std::string::npos);
    }
}

TEST(Document, HoldsNeitherFractionsNorDates) {
    for (const std::string value : {"1.5", "nan", "1979-05-27", "07:32:00"}) {
        EXPECT_THAT(refusalOf("\na = " + value).what(), StartsWith("file.toml:2: expected a text"));
    }
}

TEST(Document, IsRefusedWhereItNestsWithoutEnd) {
    const auto repeated = [](const std::string& text, std::size_t times) {
        std::string result;
        for (std::size_t index = 0; index < times; ++index) {
            result += text;
        }
        return result;
    };
    for (const std::string& text :
         {"a = " + repeated("[", 100'000), "a = " + repeated("[", 200) + repeated("]", 200),
          repeated("a.", 100'000) + "a = 1", "[" + repeated("a.", 100'000) + "a]",
          "a = " + repeated("{b=", 50'000),
          "a = " + repeated("[\n{" + repeated("b.", mostDotsOfALine) + "b=", 127) + "1" +
              repeated("}\n]", 127)}) {
        EXPECT_EQ(refusalOf(text).status(), ExitStatus::badInput) << text.substr(0, 20);
    }
    const std::string deepest = repeated("a.", deepestNesting - 1) + "a = 1";
    EXPECT_NO_THROW(static_cast<void>(parsedDocument(deepest, "f")));
    EXPECT_THAT(refusalOf("a." + deepest).what(), HasSubstr("nested too deeply"));
}

TEST(Document, OfAFileThatCannotBeReadIsAFailureOfItsOwn) {
    std::filesystem::create_directory("folder");
    raid::test::makePipe("pipe");
    for (const auto& [path, reason] : std::vector<std::pair<std::string, std::string>>{
             {"none", "No such file or directory"},
             {"none/below", "No such file or directory"},
             {"folder", "not a regular file"},
             {"pipe", "not a regular file"},
             {"/dev/zero", "not a regular file"}}) {
        const std::string file = path;
        const Failure failure = failureOf([&file] { static_cast<void>(readDocument(file)); });
        EXPECT_EQ(failure.status(), ExitStatus::noInput);
        EXPECT_EQ(failure.what(), "cannot read " + path + ": " + reason);
    }
}

TEST(Document, IsRefusedWhereItsFileIsTooLong) {
    writeFile("long", std::string(longestDocument + 1, '\n'));
    const Failure failure = failureOf([] { static_cast<void>(readDocument("long")); });
    EXPECT_EQ(failure.status(), ExitStatus::badInput);
    EXPECT_STREQ(failure.what(), "long is longer than 262144 bytes");
    writeFile("long", std::string(longestDocument, '\n'));
    EXPECT_NO_THROW(static_cast<void>(readDocument("long")));
}

TEST(Document, OfAnEmptyFileIsEmpty) {
    writeFile("empty", "");
    EXPECT_TRUE(readDocument("empty").empty());
}

TEST(TableReader, TellsOfTheFirstKeyThatNobodyKnows) {
    const Table table = parsedDocument("a = 1\nbx = 2\n", "f");
    TableReader reader{table, {"f", 1}, "thing"};
    EXPECT_EQ(numberOf(reader.need("a")), 1);
    EXPECT_EQ(reader.find("c"), nullptr);
    EXPECT_STREQ(failureOf([&reader] { reader.finish(); }).what(),
                 "f:2: unknown key of thing \"bx\"; known: a, c");
    EXPECT_STREQ(failureOf([&reader] { static_cast<void>(reader.need("d")); }).what(),
                 "f:1: thing lacks \"d\"");
    EXPECT_NE(reader.find("bx"), nullptr);
    EXPECT_NO_THROW(reader.finish());
}

TEST(ShippedFile, IsTheInstalledOneWhereThereIsOne) {
    const ShippedFile compiledIn{"file.toml", "a = 1"};
    const auto folder = std::filesystem::current_path();
    EXPECT_EQ(numberOf(shippedDocument(compiledIn, folder).at(0).setting), 1);
    writeFile("file.toml", "a = 2");
    const Table installed = shippedDocument(compiledIn, folder);
    EXPECT_EQ(numberOf(installed.at(0).setting), 2);
    EXPECT_EQ(installed.at(0).setting.place.file, (folder / "file.toml").string());
}

TEST(ShippedFile, IsNotLookedForWhereSomebodyHappensToWork) {
    writeFile("file.toml", "a = 2");
    EXPECT_EQ(numberOf(shippedDocument({"file.toml", "a = 1"}, "").at(0).setting), 1);
}

TEST(ShippedFolder, LiesBesideTheProgram) {
    EXPECT_THAT(shippedFolder().string(), testing::EndsWith("/share/raidinfo"));
    EXPECT_TRUE(shippedFolder().is_absolute());
}

}  // namespace
}  // namespace raidinfo::settings
