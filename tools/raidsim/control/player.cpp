#include "control/player.h"

#include <algorithm>
#include <utility>

namespace raidsim {

std::chrono::steady_clock::duration realTime(std::chrono::milliseconds shown, double speed) {
    using Milliseconds = std::chrono::duration<long double, std::milli>;
    constexpr std::chrono::years never{100};
    // A long double has the same digits in both widths, a double more of them in 32 bits. Finer
    // than a microsecond is only what a speed such as 0.001 is off itself.
    return std::chrono::round<std::chrono::microseconds>(
        std::min(Milliseconds(shown) / speed, Milliseconds(never)));
}

ScenarioPlayer::ScenarioPlayer(std::vector<Step> steps) : list(std::move(steps)) {
    for (std::size_t step = 0; step < list.size(); ++step)
        next.push(dueOf(step, 0));
}

ScenarioPlayer::Due ScenarioPlayer::dueOf(std::size_t step, std::uint64_t turn) const {
    return {list[step].schedule.due(turn), step, turn};
}

std::optional<ScenarioPlayer::Time> ScenarioPlayer::nextDue() const {
    if (next.empty())
        return std::nullopt;
    return next.top().at;
}

void ScenarioPlayer::advanceTo(Time elapsed, const Perform& perform) {
    while (!next.empty() && next.top().at <= elapsed) {
        const Due due = next.top();
        next.pop();
        const Step& step = list[due.step];
        if (due.turn + 1 < step.schedule.turns)
            next.push(dueOf(due.step, due.turn + 1));
        now = std::max(now, due.at);
        // Made only when it is performed, so that what is wrong with it is an error of performing.
        perform({step.line, [&](Service& service) { return step.commandAt(due.turn)(service); }});
    }
    now = std::max(now, elapsed);
}

}  // namespace raidsim
