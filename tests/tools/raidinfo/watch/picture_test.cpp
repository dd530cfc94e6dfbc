#include "watch/picture.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "text/width.h"

namespace raidinfo {
namespace {

using Change = TreeLine::Change;
using testing::ElementsAre;
using testing::IsEmpty;

TreeLine line(const std::string& path, Change change = Change::none) {
    return {path, "", path.substr(path.rfind('/') + 1) + ": ok", change};
}

const std::vector<TreeLine> tree{line("/A"),     line("/A/1"), line("/A/1/x"), line("/A/2"),
                                 line("/A/2/x"), line("/B"),   line("/B/1")};

std::vector<TreeLine> withChange(std::size_t place) {
    std::vector<TreeLine> changed = tree;
    changed.at(place).change = Change::changed;
    return changed;
}

std::vector<std::string> fitted(const Picture& picture, std::size_t columns, std::size_t rows) {
    std::vector<std::string> texts;
    for (const PictureLine& shown : fittedPicture(picture, columns, rows)) {
        texts.push_back(shown.text);
    }
    return texts;
}

TEST(Picture, IsWholeWhereItFits) {
    EXPECT_THAT(fitted({{{"time"}}, tree, {{"event"}}}, 80, 9),
                ElementsAre("time", "  A: ok", "  1: ok", "  x: ok", "  2: ok", "  x: ok",
                            "  B: ok", "  1: ok", "event"));
}

TEST(Picture, CountsTheLinesThatFindNoRoom) {
    EXPECT_THAT(fitted({{{"time"}}, tree, {{"event"}}}, 80, 6),
                ElementsAre("time", "  A: ok", "  1: ok", "  x: ok", "4 more lines", "event"));
}

TEST(Picture, PrefersWhatChangedAndThenWhatItBelongsTo) {
    EXPECT_THAT(
        fitted({{{"time"}}, withChange(4), {{"event"}}}, 80, 7),
        ElementsAre("time", "  A: ok", "  1: ok", "  2: ok", "* x: ok", "3 more lines", "event"));
    EXPECT_THAT(fitted({{{"time"}}, withChange(4), {{"event"}}}, 80, 4),
                ElementsAre("time", "* x: ok", "6 more lines", "event"));
}

TEST(Picture, ShowsALineThatChangedInFullAndCutsTheOthers) {
    const TreeLine changed{"/A", "└─ ", "drive: Critical, state 3 (failed)", Change::changed};
    TreeLine same = changed;
    same.change = Change::none;
    EXPECT_THAT(fitted({{}, {changed, same}, {{"an event that is longer"}}}, 20, 9),
                ElementsAre("* └─ drive:", "     Critical, state", "     3 (failed)",
                            "  └─ drive: Critica…", "an event that is lo…"));
}

TEST(Picture, HasNoLineThatIsWiderThanTheTerminal) {
    const TreeLine deep{"/A", "│  │  │  └─ ", "Fan 0: status 2 (failed)", Change::changed};
    for (std::size_t columns = 1; columns < 40; ++columns) {
        for (const std::size_t rows : {2U, 40U}) {
            for (const PictureLine& shown :
                 fittedPicture({{{"a heading"}}, {deep, deep}, {}}, columns, rows)) {
                EXPECT_LE(displayWidth(shown.text), columns) << shown.text;
            }
        }
    }
}

TEST(Picture, MarksWhatIsGone) {
    const auto lines = fittedPicture({{}, {line("/A", Change::gone)}, {}}, 80, 24);
    ASSERT_EQ(lines.size(), 1U);
    EXPECT_EQ(lines.front().text, "- A: ok");
    EXPECT_EQ(lines.front().style, Style::changed);
}

TEST(Picture, KeepsTheTroubleAndTheLatestEventsInTheFewestRows) {
    const Picture picture{{{"time"}, {"trouble"}}, tree, {{"older"}, {"latest"}}};
    EXPECT_THAT(fitted(picture, 80, 5),
                ElementsAre("time", "trouble", "7 more lines", "older", "latest"));
    EXPECT_THAT(fitted(picture, 80, 3), ElementsAre("time", "trouble", "latest"));
    EXPECT_THAT(fitted(picture, 80, 1), ElementsAre("time"));
    EXPECT_THAT(fitted(picture, 80, 0), IsEmpty());
}

}  // namespace
}  // namespace raidinfo
