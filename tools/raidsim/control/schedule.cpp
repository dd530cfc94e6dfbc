#include "control/schedule.h"

namespace raidsim {

namespace {

// A turn is late and chooses independently.
constexpr std::uint64_t forJitter = 0;
constexpr std::uint64_t forChoices = 1;

}  // namespace

Schedule::Time Schedule::due(std::uint64_t turn) const {
    if (turns == 1)
        return first;
    const auto gaps = static_cast<std::int64_t>(turns - 1);
    const Time even = first + (last - first) * static_cast<std::int64_t>(turn) / gaps;
    const auto choicesOfTime = static_cast<std::uint64_t>(jitter.count()) + 1;
    Draw draw({seed, step, turn, forJitter});
    return even + Time(static_cast<std::int64_t>(draw.below(choicesOfTime)));
}

Schedule::Time Schedule::gap() const {
    return turns == 1 ? Time(0) : (last - first) / static_cast<std::int64_t>(turns - 1);
}

Draw Schedule::choices(std::uint64_t turn) const { return Draw({seed, step, turn, forChoices}); }

}  // namespace raidsim
