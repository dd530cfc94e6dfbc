#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <csignal>
#include <nlohmann/json.hpp>

#include "program.h"
#include "simulator.h"

namespace raidinfo::test {
namespace {

using nlohmann::json;
using testing::HasSubstr;

std::size_t countOf(const json& tree, const std::string& key) {
    std::size_t count = 0;
    for (const auto& [name, child] : tree.items()) {
        if (name == key && child.is_array()) {
            count += child.size();
        }
        if (child.is_structured()) {
            count += countOf(child, key);
        }
    }
    return count;
}

class ShippedExample : public testing::TestWithParam<std::string> {};

TEST_P(ShippedExample, IsListedAndDrawnCompletely) {
    const Simulator simulator{GetParam()};
    const Result list = run({"list", "--json"});
    const Result tree = run({"tree", "--json"});
    EXPECT_EQ(list.errors + tree.errors, "");
    const json lists = json::parse(list.output)["data"];
    const json trees = json::parse(tree.output)["data"];
    for (const std::string key :
         {"channels", "enclosures", "fans", "power_supplies", "temperature_sensors", "arrays",
          "spanned_arrays", "logical_drives"}) {
        EXPECT_EQ(countOf(trees, key), lists[key].size()) << key;
    }
    EXPECT_EQ(run({"tree"}).status, 0);
    EXPECT_EQ(run({"list"}).status, 0);
}

INSTANTIATE_TEST_SUITE_P(OfTheSimulator, ShippedExample,
                         testing::Values("small-server.xml", "mixed.xml", "large-rack.xml"),
                         [](const auto& example) {
                             std::string name = example.param.substr(0, example.param.find('.'));
                             std::erase(name, '-');
                             return name;
                         });

TEST(SimulatedService, ShowsTheEventsThatHappenWhileTheyAreFollowed) {
    Simulator simulator{"small-server.xml"};
    simulator.command("event type=Information eventCode=1 string=\"Service started\"");
    Program events{raidinfo({"events", "--json"})};
    events.waitForOutput("Service started");
    simulator.command("event type=Critical eventCode=101 channel=1 deviceID=3 string=\"R&D\"");
    events.waitForOutput("R&D");
    events.signal(SIGINT);
    const Result result = events.finish();
    EXPECT_EQ(result.status, 130);
    EXPECT_EQ(result.errors, "");
    EXPECT_EQ(std::ranges::count(result.output, '\n'), 2);
}

TEST(SimulatedService, ShowsADriveThatFails) {
    Simulator simulator{"small-server.xml"};
    EXPECT_EQ(run({"tree"}).output.find("Critical"), std::string::npos);
    simulator.command("set adapter:1/channel:1/drive:3 state=4 overallStatus=2");
    simulator.command("event string=done");
    Program events{raidinfo({"events"})};
    events.waitForOutput("done");
    EXPECT_THAT(run({"tree"}).output, HasSubstr("Disk drive 3: Critical"));
}

}  // namespace
}  // namespace raidinfo::test
