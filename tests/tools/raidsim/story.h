#pragma once

#include <chrono>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "control/player.h"
#include "service.h"

namespace raidsim::test {

// A scenario of examples/scenarios, played by its own clock on a service without sockets.
class Story {
public:
    explicit Story(const std::string& name, std::optional<std::uint64_t> seed = {});

    // Plays on, step by step; every document on the way must hold only what clients know.
    void advanceTo(std::chrono::milliseconds elapsed);
    void playToTheEnd() { advanceTo(std::chrono::hours(1)); }

    [[nodiscard]] std::vector<std::string> read(std::string_view path, const std::string& field);
    [[nodiscard]] std::vector<std::string> status(std::string_view path) {
        return read(path, "overallStatus");
    }
    [[nodiscard]] std::size_t listings(std::string_view path);

    // A field of every kept event, in the order of their list.
    [[nodiscard]] std::vector<std::string> events(const std::string& field);

    // All that clients could see on the way: every document and, in the end, the events.
    [[nodiscard]] std::string transcript();

    // What the service said to the operator.
    [[nodiscard]] const std::vector<std::string>& said() const noexcept { return lines; }

    [[nodiscard]] Service& service() noexcept { return served; }
    [[nodiscard]] bool isOver() const { return !player.nextDue(); }

private:
    Story(Scenario scenario);
    void look();

    std::chrono::sys_seconds start;
    ScenarioPlayer player;
    Service served;
    std::string lastSeen;
    std::string seen;
    std::vector<std::string> lines;
};

}  // namespace raidsim::test
