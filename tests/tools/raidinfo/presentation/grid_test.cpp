#include "presentation/grid.h"

#include <gtest/gtest.h>

namespace raidinfo {
namespace {

GridColumn column(const std::string& title, const std::vector<std::string>& texts) {
    GridColumn result{title, false, {}};
    for (const std::string& text : texts) {
        result.cells.push_back({text});
    }
    return result;
}

const std::vector<GridColumn> three{column("#", {"0", "1"}), column("First", {"a", "bbb"}),
                                    column("Second", {"cc", ""})};

TEST(Grid, StandsInColumns) {
    EXPECT_EQ(drawn(three, {}),
              "  #  First  Second\n"
              "  0  a      cc\n"
              "  1  bbb\n");
}

TEST(Grid, MayHaveNoHeadings) {
    EXPECT_EQ(drawn(three, {.headings = false}),
              "  0  a    cc\n"
              "  1  bbb\n");
}

TEST(Grid, AlignsToTheRight) {
    GridColumn numbers = column("N", {"1", "100"});
    numbers.toTheRight = true;
    EXPECT_EQ(drawn({numbers}, {}), "    N\n    1\n  100\n");
}

TEST(Grid, IsFoldedWhereItIsTooWideAndRepeatsTheFirstColumn) {
    EXPECT_EQ(drawn(three, {.width = 18}), drawn(three, {}));
    EXPECT_EQ(drawn(three, {.width = 17}),
              "  #  First\n"
              "  0  a\n"
              "  1  bbb\n"
              "\n"
              "  #  Second\n"
              "  0  cc\n"
              "  1\n");
}

TEST(Grid, CutsNoTextHoweverNarrowTheTerminal) {
    EXPECT_EQ(drawn({column("#", {"0"}), column("Name", {"a long name"})}, {.width = 3}),
              "  #  Name\n  0  a long name\n");
}

TEST(Grid, CountsNoColourAsWidth) {
    std::vector<GridColumn> colored{column("A", {"x", "yy"}), column("B", {"1", "2"})};
    colored[0].cells[0].style = Style::critical;
    EXPECT_EQ(drawn(colored, {.headings = false, .painter = Painter{true}}),
              "  \x1b[1;31mx\x1b[0m   1\n"
              "  yy  2\n");
}

TEST(Painter, LeavesTextsAloneWithoutColours) {
    EXPECT_EQ(Painter{false}("Critical", Style::critical), "Critical");
    EXPECT_EQ(Painter{true}("plain", Style::plain), "plain");
    EXPECT_EQ(Painter{true}("", Style::critical), "");
}

}  // namespace
}  // namespace raidinfo
