#include <gtest/gtest.h>

#include <filesystem>
#include <map>
#include <sstream>
#include <string>
#include <utility>
#include <vector>

#include "program.h"
#include "simulator.h"
#include "support/files.h"

namespace raidinfo::test {
namespace {

constexpr auto nothing = "No changes\n";

// The commands of the scenario by the second at which they are given.
std::map<int, std::string> commandsOfScenario() {
    std::istringstream lines{raid::test::readFile(RAID_EXAMPLES "/failing-drive.scenario")};
    std::map<int, std::string> commands;
    for (std::string line; std::getline(lines, line);) {
        std::istringstream words{line};
        std::string at;
        int second = 0;
        if (words >> at >> second && at == "at") {
            std::string command;
            std::getline(words >> std::ws, command);
            commands[second] += command + "\n";
        }
    }
    return commands;
}

// The small server while its drive fails, told from one moment to another.
class FailingDrive : public testing::Test {
protected:
    FailingDrive() { snapshot(former); }
    ~FailingDrive() override { std::filesystem::remove(former); }

    // Gives the commands up to this second.
    void play(int second) {
        std::string due;
        while (!commands.empty() && commands.begin()->first <= second) {
            due += commands.begin()->second;
            commands.erase(commands.begin());
        }
        simulator.obey(due);
    }

    // What has changed since the last call. The document tells this story, too.
    std::string told() {
        snapshot(present);
        const Result result = run({"diff", former, present});
        EXPECT_EQ(result.errors, "");
        EXPECT_EQ(result.status, result.output == nothing ? 0 : 1);
        std::filesystem::rename(present, former);
        EXPECT_TRUE(result.output == nothing || document.find(result.output) != std::string::npos);
        return result.output;
    }

private:
    static void snapshot(const std::string& file) {
        const Result result = run({"snapshot", file});
        EXPECT_EQ(result.status, 0) << result.errors;
    }

    const std::string document = raid::test::readFile(RAIDINFO_DIFF_DOCUMENT);
    const std::string former = "former.json";
    const std::string present = "present.json";
    Simulator simulator{"small-server.xml"};
    std::map<int, std::string> commands = commandsOfScenario();
};

TEST_F(FailingDrive, IsToldStepByStepAsAnOperatorWouldTellIt) {
    EXPECT_EQ(told(), nothing);
    play(2);
    EXPECT_EQ(told(),
              "worse   adapter 1: Normal → Critical\n"
              "worse   adapter 1, channel 1, device 3: Normal → Critical, state 1 (online) → "
              "4 (failed)\n"
              "worse   adapter 1, logical drive 0: Normal → Warning, state 0 (normal) → "
              "1 (degraded)\n"
              "worse   adapter 1, logical drive 1: Normal → Warning, state 0 (normal) → "
              "1 (degraded)\n");
    play(4);
    EXPECT_EQ(told(),
              "        adapter 1, channel 1, device 3: left array 0\n"
              "worse   adapter 1, channel 2, device 1: Normal → Warning, state 2 (hot spare) → "
              "3 (rebuilding), no longer hot spare, joined array 0\n"
              "        adapter 1, logical drive 0: state 1 (degraded) → 2 (rebuilding)\n"
              "        adapter 1, logical drive 1: state 1 (degraded) → 2 (rebuilding)\n");
    play(7);
    EXPECT_EQ(told(), nothing);
    play(8);
    EXPECT_EQ(told(),
              "better  adapter 1, channel 2, device 1: Warning → Normal, state 3 (rebuilding) → "
              "1 (online)\n"
              "better  adapter 1, logical drive 0: Warning → Normal, state 2 (rebuilding) → "
              "0 (normal)\n"
              "better  adapter 1, logical drive 1: Warning → Normal, state 2 (rebuilding) → "
              "0 (normal)\n");
    play(10);
    EXPECT_EQ(told(),
              "better  adapter 1: Critical → Normal\n"
              "better  adapter 1, channel 1, device 3: drive replaced, serial QS0101003K → "
              "QS0101077K, Critical → Normal, state 4 (failed) → 2 (hot spare), became hot "
              "spare\n");
}

TEST_F(FailingDrive, IsToldAsAReplacementInTheEnd) {
    play(10);
    EXPECT_EQ(told(),
              "        adapter 1, channel 1, device 3: drive replaced, serial QS0101003K → "
              "QS0101077K, state 1 (online) → 2 (hot spare), became hot spare, left array 0\n"
              "        adapter 1, channel 2, device 1: state 2 (hot spare) → 1 (online), no longer "
              "hot spare, joined array 0\n");
}

std::string generated(const std::string& name, std::vector<std::string> options) {
    options.insert(options.begin(), {RAIDSIM_PROGRAM, "generate", "--channels", "2"});
    raid::test::writeFile(name, Program{std::move(options)}.finish().output);
    return std::filesystem::absolute(name);
}

TEST(SimulatedRack, IsTheSameHoweverTheServiceOrdersIt) {
    Simulator simulator{generated("rack.xml", {})};
    const std::string ordered = run({"tree"}).output;
    EXPECT_EQ(run({"snapshot", "rack.json"}).status, 0);
    simulator.obey("reload " + generated("shuffled.xml", {"--shuffle", "7"}));
    EXPECT_NE(run({"tree"}).output, ordered);
    const Result result = run({"diff", "rack.json"});
    EXPECT_EQ(result.output, nothing);
    EXPECT_EQ(result.status, 0);
    for (const char* const file : {"rack.xml", "shuffled.xml", "rack.json"}) {
        std::filesystem::remove(file);
    }
}

}  // namespace
}  // namespace raidinfo::test
