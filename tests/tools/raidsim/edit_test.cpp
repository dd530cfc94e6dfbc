#include "state/edit.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "running_service.h"

namespace raidsim {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::Not;

class Edit : public testing::Test {
protected:
    std::vector<std::string> values(std::string_view path, const std::string& field) {
        std::vector<std::string> found;
        for (const Match& match : findAll(document.edit(), Path::parse(path)))
            found.push_back(xml::textOf(*match.node, "as:" + field));
        return found;
    }
    std::vector<std::string> status(std::string_view path) { return values(path, "overallStatus"); }
    std::size_t count(std::string_view path) {
        return findAll(document.edit(), Path::parse(path)).size();
    }
    void set(std::string_view path, const Fields& fields) {
        setFields(document, Path::parse(path), fields);
    }

    Document document = Document::parse(test::smallSystem());
    const Path member = Path::parse("adapter:1/channel:1/drive:0");
    const Path spare = Path::parse("adapter:1/channel:2/drive:0");
    const Path array = Path::parse("adapter:1/array:7");
    const Path spares = Path::parse("adapter:1/spares");
};

TEST_F(Edit, SetChangesEveryListing) {
    set(member.text(), {{"state", "4"}});
    EXPECT_THAT(values(member.text(), "state"), ElementsAre("4", "4"));
    EXPECT_THAT(values(spare.text(), "state"), ElementsAre("2", "2"));
}

TEST_F(Edit, SetChangesTheListingsThatHaveTheField) {
    set(member.text(), {{"model", "R & S"}});
    EXPECT_THAT(values(member.text(), "model"), ElementsAre("", "R & S"));
    EXPECT_THAT(document.body(), HasSubstr("<as:model>R &amp; S</as:model>"));
}

TEST_F(Edit, ServedBodyFollowsEachChange) {
    const std::string before = document.body();
    set(member.text(), {{"state", "4"}});
    EXPECT_NE(document.body(), before);
    set(member.text(), {{"state", "1"}});
    EXPECT_EQ(document.body(), before);
}

TEST_F(Edit, OverallStatusRisesThroughEverythingAround) {
    set(member.text(), {{"overallStatus", "2"}});
    EXPECT_THAT(status("system"), ElementsAre("2"));
    EXPECT_THAT(status("adapter:1"), ElementsAre("2"));
    EXPECT_THAT(status("arrays"), ElementsAre("2"));
    EXPECT_THAT(status("array:7"), ElementsAre("2"));
    EXPECT_THAT(status("channel:1"), ElementsAre("2", "2"));
    EXPECT_THAT(status("channel:2"), ElementsAre("0"));
    EXPECT_THAT(status("spares"), ElementsAre("0"));
    set(member.text(), {{"overallStatus", "0"}});
    EXPECT_THAT(status("system"), ElementsAre("0"));
    EXPECT_THAT(status("array:7"), ElementsAre("0"));
}

TEST_F(Edit, OverallStatusWrittenToAContainerHolds) {
    set(member.text(), {{"overallStatus", "2"}});
    set(array.text(), {{"overallStatus", "1"}});
    EXPECT_THAT(status("array:7"), ElementsAre("1"));
    EXPECT_THAT(status("arrays"), ElementsAre("1"));
    EXPECT_THAT(status("system"), ElementsAre("2"));
}

TEST_F(Edit, OtherFieldsLeaveTheOverallStatusAlone) {
    set("system", {{"overallStatus", "2"}});
    set(member.text(), {{"state", "4"}});
    EXPECT_THAT(status("system"), ElementsAre("2"));
}

TEST_F(Edit, NothingChangesWhenOneFieldIsUnknown) {
    const std::string before = document.body();
    EXPECT_THROW(set(member.text(), {{"state", "4"}, {"color", "red"}}), EditError);
    EXPECT_THROW(set("adapter:1/drive:5", {{"state", "4"}}), EditError);
    EXPECT_EQ(document.body(), before);
}

TEST_F(Edit, ProgressIsShownOnceAndEnds) {
    const std::string before = document.body();
    setProgress(document, member, 10);
    setProgress(document, member, 20);
    EXPECT_THAT(document.body(),
                Not(HasSubstr("<as:percentComplete xsi:type=\"xsd:int\">10</as:percentComplete>")));
    EXPECT_THAT(document.body(),
                HasSubstr("<as:percentComplete xsi:type=\"xsd:int\">20</as:percentComplete>"));
    clearProgress(document, member);
    EXPECT_EQ(document.body(), before);
}

TEST_F(Edit, ProgressIsRefusedWhereClientsKnowNone) {
    EXPECT_THROW(setProgress(document, array, 10), EditError);
    EXPECT_THROW(clearProgress(document, Path::parse("system")), EditError);
}

TEST_F(Edit, DriveJoinsAnArrayUnderItsChannelThere) {
    join(document, spare, array);
    EXPECT_EQ(count("array:7/channel:2/drive:0"), 1U);
    EXPECT_THAT(values("array:7/channel:*", "channelID"), ElementsAre("1", "2"));
    set(spare.text(), {{"state", "3"}});
    EXPECT_THAT(values(spare.text(), "state"), ElementsAre("3", "3", "3"));
}

TEST_F(Edit, JoinedDriveLeavesAgain) {
    join(document, spare, array);
    leave(document, spare, array);
    EXPECT_EQ(count("array:7/drive:*"), 1U);
    EXPECT_EQ(count("channel:2/drive:0"), 2U);
}

TEST_F(Edit, HotSpareLeavesTheSparesAndComesBack) {
    leave(document, spare, spares);
    EXPECT_EQ(count("spares/drive:*"), 0U);
    join(document, spare, spares);
    EXPECT_EQ(count("spares/channel:2/drive:0"), 1U);
}

TEST_F(Edit, MembershipMovesTheOverallStatusAround) {
    set(member.text(), {{"overallStatus", "2"}});
    leave(document, member, array);
    EXPECT_THAT(status("array:7"), ElementsAre("0"));
    EXPECT_THAT(status("system"), ElementsAre("2"));
    join(document, member, array);
    EXPECT_THAT(status("array:7"), ElementsAre("2"));
}

TEST_F(Edit, ImpossibleMembershipsChangeNothing) {
    const std::string before = document.body();
    EXPECT_THROW(join(document, member, array), EditError);
    EXPECT_THROW(leave(document, spare, array), EditError);
    EXPECT_THROW(join(document, array, array), EditError);
    EXPECT_THROW(join(document, member, Path::parse("system")), EditError);
    EXPECT_THROW(join(document, Path::parse("drive:*"), array), EditError);
    EXPECT_THROW(join(document, Path::parse("drive:9"), array), EditError);
    EXPECT_THROW(join(document, member, Path::parse("array:8")), EditError);
    EXPECT_EQ(document.body(), before);
}

}  // namespace
}  // namespace raidsim
