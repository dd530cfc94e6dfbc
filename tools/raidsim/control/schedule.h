#pragma once

#include <chrono>
#include <cstdint>

#include "control/draw.h"

namespace raidsim {

// When a step is carried out, how often, and how late each time.
struct Schedule {
    using Time = std::chrono::milliseconds;

    Time first{0};
    Time last{0};  // the turns lie evenly between the two
    std::uint64_t turns = 1;
    Time jitter{0};  // each turn is up to so much late
    std::uint64_t seed = 0;
    std::uint64_t step = 0;  // what tells its draws from those of others

    // Does not decrease from turn to turn as long as the jitter is at most the gap.
    [[nodiscard]] Time due(std::uint64_t turn) const;

    // The time between two turns, rounded down.
    [[nodiscard]] Time gap() const;

    // What chooses at a turn.
    [[nodiscard]] Draw choices(std::uint64_t turn) const;
};

}  // namespace raidsim
