#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdio>
#include <fstream>
#include <set>
#include <sstream>
#include <string>

#include "command_line/options.h"
#include "program.h"

namespace raidinfo {
namespace {

using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::IsSupersetOf;
using testing::Not;

// What bash offers for the last of these words.
std::set<std::string> offered(const std::string& words) {
    std::ofstream{"completion.bash"} << bashCompletion();
    test::Program bash{{"/bin/bash", "-c",
                        "source ./completion.bash; COMP_WORDS=(" + words +
                            "); COMP_CWORD=$((${#COMP_WORDS[@]} - 1)); _raidinfo; "
                            "((${#COMPREPLY[@]} == 0)) || printf '%s\\n' \"${COMPREPLY[@]}\""}};
    const test::Result result = bash.finish();
    EXPECT_EQ(result.errors, "");
    std::remove("completion.bash");
    std::set<std::string> replies;
    std::istringstream lines{result.output};
    for (std::string line; std::getline(lines, line);) {
        replies.insert(line);
    }
    return replies;
}

TEST(Completion, OffersSubcommandsAndTheOptionsOfAll) {
    EXPECT_THAT(offered("raidinfo ''"),
                IsSupersetOf({"list", "health", "completion", "--json", "--from"}));
    EXPECT_THAT(offered("raidinfo he"), ElementsAre("health"));
}

TEST(Completion, OffersTheOptionsAndKindsOfASubcommand) {
    const auto replies = offered("raidinfo list ''");
    EXPECT_THAT(replies, IsSupersetOf({"disk_drives", "fans", "--filter", "-o", "--json"}));
    EXPECT_THAT(replies, Not(Contains("--nagios")));
    EXPECT_THAT(offered("raidinfo health --na"), ElementsAre("--nagios"));
    EXPECT_THAT(offered("raidinfo --json show fa"), ElementsAre("fans"));
}

TEST(Completion, OffersTheColumnsOfTheKind) {
    EXPECT_THAT(offered("raidinfo list fans -o ind"), ElementsAre("index"));
    EXPECT_THAT(offered("raidinfo list fans -o +status,ind"), ElementsAre("+status,index"));
    EXPECT_THAT(offered("raidinfo list fans --columns vendor"), IsEmpty());
}

TEST(Completion, OffersAColumnOnceAndAllOnlyByItself) {
    EXPECT_THAT(offered("raidinfo list fans -o a"), IsSupersetOf({"all", "adapter"}));
    EXPECT_THAT(offered("raidinfo list -o ''"), Contains("all"));
    const auto further = offered("raidinfo list fans -o status,index,''");
    EXPECT_THAT(further, Contains("status,index,status_name"));
    for (const char* const senseless :
         {"status,index,all", "status,index,status", "status,index,index"}) {
        EXPECT_THAT(further, Not(Contains(senseless)));
    }
    EXPECT_THAT(offered("raidinfo list fans -o +al"), IsEmpty());
    EXPECT_THAT(offered("raidinfo list fans -o +index,ind"), IsEmpty());
    EXPECT_THAT(offered("raidinfo list fans --columns = index,al"), IsEmpty());
}

TEST(Completion, OffersTheColumnsOfTheKindAsStartsOfAFilter) {
    EXPECT_THAT(offered("raidinfo list fans --filter ind"), ElementsAre("index"));
    EXPECT_THAT(offered("raidinfo list fans --filter vendor"), IsEmpty());
    EXPECT_THAT(offered("raidinfo list --filter vendor"), Contains("vendor"));
    EXPECT_THAT(offered("raidinfo list fans --filter status = ''"), IsEmpty());
}

TEST(Completion, OffersNoKindWhereThePositionStands) {
    const auto replies = offered("raidinfo show fans ''");
    EXPECT_THAT(replies, Contains("--json"));
    EXPECT_THAT(replies, Not(Contains("fans")));
    EXPECT_THAT(offered("raidinfo list fans fa"), IsEmpty());
}

TEST(Completion, TakesTheValueOfAnOptionForNoOperand) {
    EXPECT_THAT(offered("raidinfo --timeout 5 sho"), ElementsAre("show"));
    EXPECT_THAT(offered("raidinfo --from list sho"), ElementsAre("show"));
    EXPECT_THAT(offered("raidinfo list --filter status = 0 fa"), ElementsAre("fans"));
}

TEST(Completion, OffersTheValuesOfAnOption) {
    EXPECT_THAT(offered("raidinfo list --color ''"), ElementsAre("always", "auto", "never"));
    EXPECT_THAT(offered("raidinfo --from ./completion"), ElementsAre("./completion.bash"));
    EXPECT_THAT(offered("raidinfo diff ./completion"), ElementsAre("./completion.bash"));
    EXPECT_THAT(offered("raidinfo list '>' ./completion"), ElementsAre("./completion.bash"));
}

// bash has cut the word at the "=".
TEST(Completion, OffersTheValuesBehindAnEqualsSign) {
    EXPECT_THAT(offered("raidinfo list --color = al"), ElementsAre("always"));
    EXPECT_THAT(offered("raidinfo list --color ="), ElementsAre("always", "auto", "never"));
    EXPECT_THAT(offered("raidinfo list fans --columns = +status,ind"),
                ElementsAre("+status,index"));
    EXPECT_THAT(offered("raidinfo --from = ./completion"), ElementsAre("./completion.bash"));
}

}  // namespace
}  // namespace raidinfo
