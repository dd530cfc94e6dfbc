#include "watch/tree_lines.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "watch/picture.h"

namespace raidinfo {
namespace {

using testing::ElementsAre;

Node node(const std::string& title, const std::string& remark,
          const std::vector<Node>& children = {}) {
    return {.title = title, .remark = remark, .groups = {{"children", children}}};
}

std::vector<TreeLine> lines(const std::vector<Node>& roots) {
    return treeLines({"roots", roots}, CodeBook{});
}

std::vector<std::string> texts(const std::vector<TreeLine>& lines) {
    std::vector<std::string> result;
    for (const PictureLine& line : wholePicture({.above = {}, .tree = lines, .below = {}})) {
        result.push_back(line.text);
    }
    return result;
}

TEST(WatchedTree, MarksNothingWhereNothingHasChanged) {
    const auto before = lines({node("A", "ok", {node("B", "ok")})});
    auto now = before;
    EXPECT_FALSE(markChanges(now, before));
    EXPECT_THAT(texts(now), ElementsAre("  A: ok", "  └─ B: ok"));
}

TEST(WatchedTree, MarksWhatComesWhereNothingWas) {
    auto now = lines({node("A", "ok", {node("B", "ok")})});
    EXPECT_TRUE(markChanges(now, {}));
    EXPECT_THAT(texts(now), ElementsAre("* A: ok", "* └─ B: ok"));
}

TEST(WatchedTree, MarksThatNothingIsLeft) {
    std::vector<TreeLine> now;
    EXPECT_TRUE(markChanges(now, lines({node("A", "ok")})));
    EXPECT_THAT(texts(now), ElementsAre("- A: gone"));
}

TEST(WatchedTree, KeepsTheMarksOfALineThatReadsTheSameAndOfOneThatIsStillGone) {
    const auto first = lines({node("A", "ok", {node("B", "ok"), node("C", "ok")})});
    const auto changed = lines({node("A", "ok", {node("B", "bad")})});
    auto second = changed;
    markChanges(second, first);
    auto third = changed;
    EXPECT_FALSE(markChanges(third, second));
    keepMarks(third, second);
    EXPECT_THAT(texts(third), ElementsAre("  A: ok", "* └─ B: bad", "- A/C: gone"));
    auto fourth = first;
    EXPECT_TRUE(markChanges(fourth, third));
    keepMarks(fourth, third);
    EXPECT_THAT(texts(fourth), ElementsAre("  A: ok", "* ├─ B: ok", "* └─ C: ok"));
}

TEST(WatchedTree, MarksWhatReadsOtherwiseWhatIsNewAndWhatIsGone) {
    const auto before = lines({node("A", "ok", {node("B", "ok"), node("C", "ok")})});
    auto now = lines({node("A", "ok", {node("B", "bad"), node("D", "ok")})});
    EXPECT_TRUE(markChanges(now, before));
    EXPECT_THAT(texts(now), ElementsAre("  A: ok", "* ├─ B: bad", "* └─ D: ok", "- A/C: gone"));
}

TEST(WatchedTree, ForgetsWhatIsGoneAfterOnce) {
    const auto first = lines({node("A", "ok", {node("B", "ok")})});
    auto second = lines({node("A", "ok")});
    EXPECT_TRUE(markChanges(second, first));
    auto third = lines({node("A", "ok")});
    EXPECT_FALSE(markChanges(third, second));
    EXPECT_THAT(texts(third), ElementsAre("  A: ok"));
}

TEST(WatchedTree, TellsLinesOfTheSameTitleApart) {
    const auto before = lines({node("A", "1"), node("A", "2")});
    auto now = lines({node("A", "1"), node("A", "3")});
    EXPECT_TRUE(markChanges(now, before));
    EXPECT_THAT(texts(now), ElementsAre("  A: 1", "* A: 3"));
}

}  // namespace
}  // namespace raidinfo
