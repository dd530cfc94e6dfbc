#include "presentation/tree.h"

#include <gtest/gtest.h>

#include "inventory/tree.h"
#include "sample.h"

namespace raidinfo {
namespace {

using test::sample;

Node bare(std::string title, std::vector<Node> children = {}) {
    return {.title = std::move(title), .groups = {{"children", std::move(children)}}};
}

TEST(DrawnTree, ConnectsChildrenWithTheirParent) {
    EXPECT_EQ(
        drawn({"roots",
               {bare("a", {bare("b", {bare("c"), bare("d")}), bare("e", {bare("f")})}), bare("g")}},
              CodeBook{}),
        "a\n"
        "├─ b\n"
        "│  ├─ c\n"
        "│  └─ d\n"
        "└─ e\n"
        "   └─ f\n"
        "g\n");
}

TEST(DrawnTree, OfNothingSaysSo) { EXPECT_EQ(drawn({"roots", {}}, CodeBook{}), "No adapters\n"); }

TEST(DrawnTree, DrawsTheChildrenOfAllGroupsAsOneList) {
    Node root = bare("a", {bare("b")});
    root.groups.push_back({"empty", {}});
    root.groups.push_back({"others", {bare("c")}});
    EXPECT_EQ(drawn({"roots", {root}}, CodeBook{}), "a\n├─ b\n└─ c\n");
}

TEST(DrawnTree, SummarisesARecord) {
    const Kind& drives = kindOf(KindId::diskDrive);
    const Record drive = sample(drives, {{"overall_status", std::string{"Critical"}},
                                         {"model", std::string{"M\x1b"}},
                                         {"size", 34715},
                                         {"state", 4},
                                         {"smart_error", true},
                                         {"type", 9}});
    const Node node{
        .title = "Disk drive 3", .remark = "hot spare", .kind = &drives, .record = &drive};
    EXPECT_EQ(drawn({"roots", {node}}, CodeBook{}),
              "Disk drive 3: hot spare, Critical, model M\\u{1b}, size 34715, state 4, "
              "SMART error\n");
}

TEST(DrawnTree, SaysThatAStatusIsUnknown) {
    const Kind& drives = kindOf(KindId::logicalDrive);
    const Record drive = sample(drives, {{"overall_status", Unknown{}}});
    const Node node{.title = "Logical drive 0", .kind = &drives, .record = &drive};
    EXPECT_EQ(drawn({"roots", {node}}, CodeBook{}),
              "Logical drive 0: overall status unknown, RAID level 0, state 0, data space 0\n");
}

TEST(DrawnTree, RepeatsNothingOfARecordThatStandsElsewhere) {
    const Kind& drives = kindOf(KindId::diskDrive);
    const Record drive = sample(drives, {{"size", 34715}});
    const Node node{.title = "Disk drive 3",
                    .remark = "channel 1",
                    .kind = &drives,
                    .record = &drive,
                    .inFull = false};
    EXPECT_EQ(drawn({"roots", {node}}, CodeBook{}), "Disk drive 3: channel 1\n");
}

}  // namespace
}  // namespace raidinfo
