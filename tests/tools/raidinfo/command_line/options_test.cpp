#include "options.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <vector>

#include "exit_status.h"

namespace raidinfo {
namespace {

using testing::HasSubstr;

std::variant<Options, Information> parse(std::vector<const char*> arguments) {
    arguments.insert(arguments.begin(), "raidinfo");
    return parseOptions(static_cast<int>(arguments.size()), arguments.data());
}

Options options(std::vector<const char*> arguments) {
    return std::get<Options>(parse(std::move(arguments)));
}

std::string information(std::vector<const char*> arguments) {
    return std::get<Information>(parse(std::move(arguments))).text;
}

TEST(Options, NameTheCommand) {
    EXPECT_EQ(options({"list"}).command, Command::list);
    EXPECT_EQ(options({"tree"}).command, Command::tree);
    EXPECT_EQ(options({"events"}).command, Command::events);
}

TEST(Options, AskForJsonAndALibraryOnEitherSideOfTheCommand) {
    EXPECT_FALSE(options({"list"}).json);
    EXPECT_TRUE(options({"tree", "--json"}).json);
    EXPECT_EQ(options({"list"}).library, std::nullopt);
    EXPECT_EQ(options({"--library", "a.so", "list"}).library, "a.so");
    EXPECT_EQ(options({"events", "--library", "b.so"}).library, "b.so");
}

TEST(Options, LimitTheWaitForTheInventoryOnly) {
    EXPECT_EQ(options({"list"}).limit, std::chrono::seconds{60});
    EXPECT_EQ(options({"tree", "--timeout", "5"}).limit, std::chrono::seconds{5});
    EXPECT_EQ(options({"tree", "--timeout", "0"}).limit, std::nullopt);
    EXPECT_EQ(options({"events", "--timeout", "5"}).limit, std::nullopt);
}

TEST(Options, ThatAreWrongAreAUsageFailure) {
    using Arguments = std::vector<const char*>;
    for (const Arguments& wrong :
         {Arguments{}, Arguments{"lists"}, Arguments{"list", "tree", "--jso"},
          Arguments{"list", "--jsonn"}, Arguments{"list", "extra"}, Arguments{"--json", "list"},
          Arguments{"list", "--timeout", "-1"}, Arguments{"list", "--timeout", "soon"},
          Arguments{"list", "--library"}}) {
        try {
            static_cast<void>(parse(wrong));
            FAIL() << "accepted: " << testing::PrintToString(wrong);
        } catch (const Failure& failure) {
            EXPECT_EQ(failure.status(), ExitStatus::usage);
        }
    }
}

TEST(Options, ExplainThemselves) {
    EXPECT_THAT(information({"--help"}), HasSubstr("130 interrupted"));
    EXPECT_THAT(information({"events", "--help"}), HasSubstr("raidinfo events"));
    EXPECT_THAT(information({"--version"}), testing::StartsWith("raidinfo "));
}

}  // namespace
}  // namespace raidinfo
