#include <gtest/gtest.h>

#include <csignal>
#include <nlohmann/json.hpp>
#include <optional>
#include <sstream>
#include <string>
#include <vector>

#include "program.h"
#include "simulator.h"

namespace raidinfo::test {
namespace {

using nlohmann::json;

// The simulator with the storm of ten thousand events, up to some second of it.
class Storm {
public:
    explicit Storm(int second)
        : program{{RAIDSIM_PROGRAM, "--clock", "virtual", "--scenario",
                   RAID_EXAMPLES "/scenarios/event-storm.scenario"}} {
        program.waitForOutput("listening");
        advance(second);
    }

    void advance(int seconds) {
        now += seconds;
        program.send("advance " + std::to_string(seconds) + "\n");
        program.waitForOutput("time " + std::to_string(now));
    }

    void killService() {
        program.signal(SIGKILL);
        static_cast<void>(program.finish());
    }

private:
    Program program;
    int now = 0;
};

TEST(EventsThroughAStorm, AreAllShownOnceWhileTheServiceIsKilledAndRestartedThreeTimes) {
    constexpr int events = 10'000;
    std::optional<Storm> storm;
    storm.emplace(12);
    const std::string count = std::to_string(events);
    Program follower{raidinfo({"events", "--since", "1", "--count", count, "--json"})};
    follower.waitForOutput("\"sequence_number\":500,");
    // Each time the service comes back without its events, and tells them again.
    for (int restart = 1; restart <= 3; ++restart) {
        storm->killService();
        follower.waitForOutput("service_unavailable", restart);
        storm.emplace(12 + 8 * restart);
        follower.waitForOutput("service_available", restart);
    }
    storm->advance(60);
    const Result result = follower.finish();
    EXPECT_EQ(result.status, 0);
    std::vector<int> numbers;
    std::istringstream lines{result.output};
    for (std::string line; std::getline(lines, line);) {
        const json data = json::parse(line)["data"];
        if (data.is_object()) {
            numbers.push_back(data["sequence_number"]);
        }
    }
    std::vector<int> wanted(events);
    for (int number = 0; number < events; ++number) {
        wanted[static_cast<std::size_t>(number)] = number + 1;
    }
    EXPECT_EQ(numbers, wanted);
}

void raise(Simulator& service, const std::string& name, int count) {
    for (int number = 1; number <= count; ++number) {
        service.command("event string=" + name + std::to_string(number));
    }
}

TEST(EventsThroughARestart, AreShownOnceWhenTheServiceThenHasOtherEventsAndMoreThanItTellsAtOnce) {
    constexpr int before = 107;
    constexpr int after = 300;
    std::optional<Simulator> service{"small-server.xml"};
    raise(*service, "E", before);
    const std::string count = std::to_string(before + after);
    Program follower{raidinfo({"events", "--since", "1", "--count", count, "--json"})};
    follower.waitForOutput("\"E107\"");
    service.reset();
    follower.waitForOutput("service_unavailable");
    service.emplace("small-server.xml");
    raise(*service, "F", after);
    const Result result = follower.finish();
    std::vector<std::string> told;
    int restarts = 0;
    std::istringstream lines{result.output};
    for (std::string line; std::getline(lines, line);) {
        const json document = json::parse(line);
        if (document["data"].is_object()) {
            told.push_back(document["data"]["message_string"]);
        } else {
            restarts += document["errors"][0]["code"] == "numbers_went_back" ? 1 : 0;
        }
    }
    std::vector<std::string> wanted;
    for (int number = 1; number <= before; ++number) {
        wanted.push_back("E" + std::to_string(number));
    }
    for (int number = 1; number <= after; ++number) {
        wanted.push_back("F" + std::to_string(number));
    }
    EXPECT_EQ(told, wanted);
    EXPECT_EQ(restarts, 1);
}

}  // namespace
}  // namespace raidinfo::test
