#pragma once

#include <chrono>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <optional>
#include <queue>
#include <tuple>
#include <utility>
#include <vector>

#include "control/scenario.h"

namespace raidsim {

// How long the real clock takes to show that time, so many times as fast. A recording may tell
// times that no clock can count; they are as good as never.
[[nodiscard]] std::chrono::steady_clock::duration realTime(std::chrono::milliseconds shown,
                                                           double speed);

// Plays steps as the time it is given passes; keeps no clock of its own.
class ScenarioPlayer {
public:
    using Time = std::chrono::milliseconds;
    using Perform = std::function<void(const ScriptLine&)>;

    explicit ScenarioPlayer(std::vector<Step> steps);
    explicit ScenarioPlayer(Scenario scenario) : ScenarioPlayer(std::move(scenario.steps)) {}

    // When the next step is due, counted from the start; nothing at the end.
    [[nodiscard]] std::optional<Time> nextDue() const;

    // Performs every step that is due at that time and was not performed yet: by time, and at one
    // time in the order of the steps.
    void advanceTo(Time elapsed, const Perform& perform);

    // What the clock shows: while a step is performed, when it was due.
    [[nodiscard]] Time elapsed() const noexcept { return now; }

private:
    struct Due {
        Time at;
        std::size_t step;
        std::uint64_t turn;

        friend bool operator>(const Due& left, const Due& right) {
            return std::tie(left.at, left.step, left.turn) >
                   std::tie(right.at, right.step, right.turn);
        }
    };

    [[nodiscard]] Due dueOf(std::size_t step, std::uint64_t turn) const;

    std::vector<Step> list;
    std::priority_queue<Due, std::vector<Due>, std::greater<>> next;  // one turn of each step
    Time now{0};
};

}  // namespace raidsim
