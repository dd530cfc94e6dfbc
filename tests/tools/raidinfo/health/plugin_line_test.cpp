#include "plugin_line.h"

#include <gtest/gtest.h>

namespace raidinfo::test {
namespace {

TEST(PluginLine, IsTakenApart) {
    const PluginLine line = parsedPluginLine(
        "DISK WARNING - /var is filling | /var=91%;90;95;0;100 'my disk'=-1.5MB;@1:2;~:3 n=4\n");
    EXPECT_EQ(line.service, "DISK");
    EXPECT_EQ(line.state, "WARNING");
    EXPECT_EQ(line.text, "/var is filling");
    ASSERT_EQ(line.data.size(), 3U);
    EXPECT_EQ(line.data[0].unit, "%");
    EXPECT_EQ(line.data[0].maximum, "100");
    EXPECT_EQ(line.data[1].label, "my disk");
    EXPECT_EQ(line.data[1].value, -1.5);
    EXPECT_EQ(line.data[1].warning, "@1:2");
    EXPECT_EQ(line.data[1].critical, "~:3");
    EXPECT_EQ(line.data[2].label, "n");
}

TEST(PluginLine, NeedsNoData) { EXPECT_TRUE(parsedPluginLine("A OK - b\n").data.empty()); }

TEST(PluginLine, IsRefusedWhereItBreaksTheGrammar) {
    for (const char* const line : {"A OK - b",
                                   "A OK - b\n\n",
                                   "A OK - b\nc\n",
                                   "A FINE - b\n",
                                   "A OK b\n",
                                   "A OK - \n",
                                   "A OK - b|c=1\n",
                                   "A OK - b | \n",
                                   "A OK - b | c\n",
                                   "A OK - b | c=\n",
                                   "A OK - b | c=x\n",
                                   "A OK - b | c d=1\n",
                                   "A OK - b | 'c d=1\n",
                                   "A OK - b | c'd=1\n",
                                   "A OK - b | 'c=d'=1\n",
                                   "A OK - b | =1\n",
                                   "A OK - b | ''=1\n",
                                   "A OK - b | c=1;x\n",
                                   "A OK - b | c=1;;;;;\n",
                                   "A OK - b | c=1  d=2\n",
                                   "A OK - b | c=1 | d=2\n",
                                   "A OK - b | c=1kg\n",
                                   "A OK - b | c=1;@\n",
                                   "A OK - b | c=1;~\n",
                                   "A OK - b | c=1;~:\n",
                                   "A OK - b | c=1;;;x\n"}) {
        EXPECT_THROW(static_cast<void>(parsedPluginLine(line)), NoPluginLine) << line;
    }
}

TEST(PluginRange, AlertsOutsideOrInside) {
    EXPECT_FALSE(alerts("", 5));
    EXPECT_FALSE(alerts("0", 0));
    EXPECT_TRUE(alerts("0", 1));
    EXPECT_TRUE(alerts("10:", 9));
    EXPECT_FALSE(alerts("~:10", -9));
    EXPECT_TRUE(alerts("@10:20", 15));
    EXPECT_FALSE(alerts("@10:20", 21));
}

}  // namespace
}  // namespace raidinfo::test
