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
const CodeBook book = shippedCodeBook();

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
            sample(drives, {{"state", 12}, {"overall_status", Unknown{}}})};
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
        return column(filtered(listing, filters, book), "position");
    }

    Snapshot snapshot;
    Listing listing{nullptr, {}, {}};
};

TEST_F(DriveListing, HasAColumnForPositionTreeAndEachField) {
    EXPECT_EQ(listing.columns.size(), 1 + 2 + drives.fields.size());
    EXPECT_THAT(column(listing, "position"), ElementsAre(Value{0}, Value{1}, Value{2}));
    EXPECT_THAT(column(listing, "device_id"), ElementsAre(Value{8}, Value{9}, Unknown{}));
    EXPECT_THAT(column(listing, "hot_spare"), ElementsAre(Value{false}, Value{true}, Unknown{}));
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
    EXPECT_THAT(positionsWhere({"smart_error~y"}), ElementsAre(Value{1}));
    EXPECT_THAT(positionsWhere({"smart_error!=true"}), ElementsAre(Value{0}, Value{2}));
    EXPECT_THAT(positionsWhere({"overall_status!=Normal"}), ElementsAre(Value{1}, Value{2}));
    EXPECT_THAT(positionsWhere({"overall_status=unknown"}), ElementsAre(Value{2}));
}

TEST_F(DriveListing, IsFilteredByTheNamesOfCodes) {
    EXPECT_THAT(positionsWhere({"state=online"}), ElementsAre(Value{0}));
    EXPECT_THAT(positionsWhere({"state!=online"}), ElementsAre(Value{1}, Value{2}));
    EXPECT_THAT(positionsWhere({"state~fail"}), ElementsAre(Value{1}));
    EXPECT_THAT(positionsWhere({"state=unknown"}), ElementsAre(Value{2}))
        << "a code without a name";
}

TEST_F(DriveListing, SaysWhichNamesTheCodesHave) {
    for (const char* const wrong : {"state=onlin", "state<online"}) {
        try {
            static_cast<void>(positionsWhere({wrong}));
            ADD_FAILURE() << wrong;
        } catch (const Failure& failure) {
            EXPECT_THAT(failure.what(), HasSubstr("online"));
            EXPECT_THAT(failure.what(), HasSubstr("unknown"));
        }
    }
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

// The library publishes fans without what they belong to.
TEST(FanListing, TellsWhatTheFanBelongsTo) {
    Snapshot snapshot;
    snapshot.of(KindId::fan) = {sample(fans, {})};
    const Node fan{.title = "Fan 3",
                   .number = 3,
                   .extras = {{"index", 3}},
                   .kind = &fans,
                   .record = &snapshot.of(KindId::fan).front(),
                   .position = 0};
    const Node enclosure{.title = "Enclosure 6", .number = 6, .groups = {{"fans", {fan}}}};
    const Node channel{.title = "Channel 2", .number = 2, .groups = {{"enclosures", {enclosure}}}};
    const Node adapter{.title = "Adapter 1", .number = 1, .groups = {{"channels", {channel}}}};
    const Listing listing = listingOf(fans, snapshot, {"adapters", {adapter}});
    ASSERT_EQ(listing.rows.size(), 1U);
    const std::vector<Value> place(listing.rows.front().begin(), listing.rows.front().begin() + 5);
    EXPECT_THAT(place, ElementsAre(Value{0}, Value{3}, Value{6}, Value{2}, Value{1}));
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
    EXPECT_NO_THROW(checkFilters({parseFilter("overall_status=unknown")}, drives, book));
    for (const char* const wrong : {"nokey=1", "state=many", "overall_status=Bogus"}) {
        EXPECT_THROW(checkFilters({parseFilter(wrong)}, drives, book), Failure) << wrong;
    }
}

TEST(Filter, ConcernsTheKindsThatHaveItsColumn) {
    EXPECT_TRUE(concerns(parseFilter("smart_error=1"), drives));
    EXPECT_FALSE(concerns(parseFilter("smart_error=1"), fans));
    EXPECT_TRUE(concerns(parseFilter("index=1"), fans));
    EXPECT_TRUE(concerns(parseFilter("position=1"), fans));
}

std::vector<std::string_view> keysOf(const std::vector<std::size_t>& columns, const Kind& kind) {
    std::vector<std::string_view> keys;
    for (const std::size_t column : columns) {
        keys.push_back(columnsOf(kind)[column].key);
    }
    return keys;
}

TEST(Columns, AreTheChiefOnesAndMore) {
    const auto chief = chosenColumns({.chief = true}, fans);
    EXPECT_THAT(keysOf(chief, fans),
                ElementsAre("position", "index", "enclosure", "channel", "adapter", "status"));
    EXPECT_THAT(
        keysOf(chosenColumns(parseColumns("+fan_name,status"), fans), fans),
        ElementsAre("position", "index", "enclosure", "channel", "adapter", "status", "fan_name"));
    EXPECT_EQ(chosenColumns(parseColumns("all"), fans).size(), columnsOf(fans).size());
}

TEST(Columns, ThatAKindDoesNotHaveAreRefusedWithThoseItHas) {
    try {
        static_cast<void>(chosenColumns(parseColumns("speed"), fans));
        FAIL();
    } catch (const Failure& failure) {
        EXPECT_EQ(failure.status(), ExitStatus::usage);
        EXPECT_THAT(failure.what(), HasSubstr("\"speed\""));
        EXPECT_THAT(failure.what(), HasSubstr("position, index, enclosure"));
    }
    for (const char* const wrong : {"", "+", "a,,b", "a,"}) {
        EXPECT_THROW(static_cast<void>(parseColumns(wrong)), Failure) << wrong;
    }
}

}  // namespace
}  // namespace raidinfo
