#include "listing/listing.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "exit_status.h"
#include "listing/column_choice.h"
#include "listing/filter.h"
#include "sample.h"

namespace raidinfo {
namespace {

using test::sample;
using testing::ElementsAre;
using testing::HasSubstr;

const Kind& drives = kindOf(KindId::diskDrive);
const Kind& fans = kindOf(KindId::fan);

// Three drives, of which the tree knows the first two.
class DriveListing : public testing::Test {
protected:
    DriveListing() {
        snapshot.of(KindId::diskDrive) = {
            sample(drives, {{"vendor", "QUILLON"}, {"state", 1}, {"overall_status", "Normal"}}),
            sample(drives, {{"vendor", "BRASK"},
                            {"state", 4},
                            {"overall_status", "Critical"},
                            {"smart_error", true}}),
            sample(drives, {{"state", 12}, {"overall_status", UnknownStatus{}}})};
        Node channel{.title = "Channel 1"};
        for (std::size_t position = 0; position < 2; ++position) {
            channel.groups.push_back(
                {"disk_drives",
                 {Node{.title = "",
                       .extras = {{"device_id", static_cast<int>(position) + 8},
                                  {"hot_spare", position == 1}},
                       .kind = &drives,
                       .record = &snapshot.of(KindId::diskDrive)[position],
                       .position = position}}});
        }
        listing = listingOf(drives, snapshot, {"adapters", {channel}});
    }

    std::vector<Value> column(const Listing& from, std::string_view key) const {
        std::vector<Value> values;
        for (std::size_t index = 0; index < from.columns.size(); ++index) {
            for (const auto& row : from.rows) {
                if (from.columns[index].key == key) {
                    values.push_back(row[index]);
                }
            }
        }
        return values;
    }

    std::vector<Value> positionsWhere(const std::vector<const char*>& conditions) const {
        std::vector<Filter> filters;
        for (const char* const condition : conditions) {
            filters.push_back(parseFilter(condition));
        }
        return column(filtered(listing, filters), "position");
    }

    Snapshot snapshot;
    Listing listing{nullptr, {}, {}};
};

TEST_F(DriveListing, HasAColumnForPositionTreeAndEachField) {
    EXPECT_EQ(listing.columns.size(), 1 + 2 + drives.fields.size());
    EXPECT_THAT(column(listing, "position"), ElementsAre(Value{0}, Value{1}, Value{2}));
    EXPECT_THAT(column(listing, "device_id"), ElementsAre(Value{8}, Value{9}, UnknownStatus{}));
    EXPECT_THAT(column(listing, "hot_spare"),
                ElementsAre(Value{false}, Value{true}, UnknownStatus{}));
    EXPECT_THAT(column(listing, "state"), ElementsAre(Value{1}, Value{4}, Value{12}));
}

TEST_F(DriveListing, IsFilteredByNumbers) {
    EXPECT_THAT(positionsWhere({"state!=1"}), ElementsAre(Value{1}, Value{2}));
    EXPECT_THAT(positionsWhere({"state=4"}), ElementsAre(Value{1}));
    EXPECT_THAT(positionsWhere({"state<4"}), ElementsAre(Value{0}));
    EXPECT_THAT(positionsWhere({"state<=4"}), ElementsAre(Value{0}, Value{1}));
    EXPECT_THAT(positionsWhere({"state>4"}), ElementsAre(Value{2}));
    EXPECT_THAT(positionsWhere({"state>=4"}), ElementsAre(Value{1}, Value{2}));
    EXPECT_THAT(positionsWhere({"state~1"}), ElementsAre(Value{0}, Value{2}));
    EXPECT_THAT(positionsWhere({"state=99999999999"}), testing::IsEmpty());
}

TEST_F(DriveListing, IsFilteredByTextsFlagsAndStatus) {
    EXPECT_THAT(positionsWhere({"vendor=BRASK"}), ElementsAre(Value{1}));
    EXPECT_THAT(positionsWhere({"vendor~UIL"}), ElementsAre(Value{0}));
    EXPECT_THAT(positionsWhere({"vendor="}), ElementsAre(Value{2}));
    EXPECT_THAT(positionsWhere({"smart_error=yes"}), ElementsAre(Value{1}));
    EXPECT_THAT(positionsWhere({"smart_error!=true"}), ElementsAre(Value{0}, Value{2}));
    EXPECT_THAT(positionsWhere({"overall_status!=Normal"}), ElementsAre(Value{1}, Value{2}));
    EXPECT_THAT(positionsWhere({"overall_status=unknown"}), ElementsAre(Value{2}));
}

TEST_F(DriveListing, IsFilteredByAllConditionsTogether) {
    EXPECT_THAT(positionsWhere({"state>1", "vendor!=BRASK"}), ElementsAre(Value{2}));
}

TEST_F(DriveListing, RefusesAFilterThatMakesNoSense) {
    for (const char* const wrong :
         {"speed=1", "state=many", "smart_error=perhaps", "overall_status=Bogus",
          "overall_status!=normal", "position=last"}) {
        EXPECT_THROW(static_cast<void>(positionsWhere({wrong})), Failure) << wrong;
    }
}

TEST_F(DriveListing, RefusesAValueOfTheWrongKindAlsoWhenThereIsNoRecord) {
    listing.rows.clear();
    EXPECT_THROW(static_cast<void>(positionsWhere({"state=many"})), Failure);
    EXPECT_THROW(static_cast<void>(positionsWhere({"smart_error=2"})), Failure);
}

TEST_F(DriveListing, IsFilteredByPartOfAStatus) {
    EXPECT_THAT(positionsWhere({"overall_status~Crit"}), ElementsAre(Value{1}));
}

TEST_F(DriveListing, ShowsTheColumnsThatAreChosenInTheirOrder) {
    const auto columns = chosenColumns(parseColumns("state,position,state"), drives);
    const Listing chosen = withColumns(listing, columns);
    ASSERT_EQ(chosen.columns.size(), 2U);
    EXPECT_EQ(chosen.columns[0].key, "state");
    EXPECT_THAT(chosen.rows[1], ElementsAre(Value{4}, Value{1}));
}

TEST(Filter, IsReadFromItsText) {
    const Filter filter = parseFilter("overall_status!=a=b");
    EXPECT_EQ(filter.key, "overall_status");
    EXPECT_EQ(filter.comparison, Filter::Comparison::notEqual);
    EXPECT_EQ(filter.value, "a=b");
    for (const char* const wrong : {"", "state", "=1", "state!1"}) {
        EXPECT_THROW(static_cast<void>(parseFilter(wrong)), Failure) << wrong;
    }
}

TEST(Filter, IsCheckedWithoutAnyRecord) {
    EXPECT_NO_THROW(checkFilters({parseFilter("overall_status=unknown")}, drives));
    for (const char* const wrong : {"nokey=1", "state=many", "overall_status=Bogus"}) {
        EXPECT_THROW(checkFilters({parseFilter(wrong)}, drives), Failure) << wrong;
    }
}

TEST(Filter, ConcernsTheKindsThatHaveItsColumn) {
    EXPECT_TRUE(concerns(parseFilter("smart_error=1"), drives));
    EXPECT_FALSE(concerns(parseFilter("smart_error=1"), fans));
    EXPECT_TRUE(concerns(parseFilter("index=1"), fans));
    EXPECT_TRUE(concerns(parseFilter("position=1"), fans));
}

TEST(Columns, AreTheChiefOnesAndMore) {
    const auto chief = chosenColumns({.chief = true}, fans);
    EXPECT_THAT(chief, ElementsAre(0U, 1U, 6U, 7U, 8U, 9U));
    EXPECT_THAT(chosenColumns(parseColumns("+fan_name,status"), fans),
                ElementsAre(0U, 1U, 6U, 7U, 8U, 9U, 2U));
    EXPECT_EQ(chosenColumns(parseColumns("all"), fans).size(), columnsOf(fans).size());
}

TEST(Columns, ThatAKindDoesNotHaveAreRefusedWithThoseItHas) {
    try {
        static_cast<void>(chosenColumns(parseColumns("speed"), fans));
        FAIL();
    } catch (const Failure& failure) {
        EXPECT_EQ(failure.status(), ExitStatus::usage);
        EXPECT_THAT(failure.what(), HasSubstr("\"speed\""));
        EXPECT_THAT(failure.what(), HasSubstr("position, index, fan_name"));
    }
    for (const char* const wrong : {"", "+", "a,,b", "a,"}) {
        EXPECT_THROW(static_cast<void>(parseColumns(wrong)), Failure) << wrong;
    }
}

}  // namespace
}  // namespace raidinfo
