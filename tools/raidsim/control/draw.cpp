#include "control/draw.h"

namespace raidsim {

namespace {

// Spreads what differs in one bit over all of them; different numbers stay different.
constexpr std::uint64_t spread(std::uint64_t bits) noexcept {
    bits = (bits ^ (bits >> 30U)) * 0xBF58476D1CE4E5B9U;
    bits = (bits ^ (bits >> 27U)) * 0x94D049BB133111EBU;
    return bits ^ (bits >> 31U);
}

// Odd, and its bits without a pattern, so that the states reach every number.
constexpr std::uint64_t stride = 0x9E3779B97F4A7C15U;

}  // namespace

Draw::Draw(std::initializer_list<std::uint64_t> place) noexcept {
    for (const std::uint64_t number : place)
        state = spread(state + stride + number);
}

std::uint64_t Draw::next() noexcept {
    state += stride;
    return spread(state);
}

std::uint64_t Draw::below(std::uint64_t bound) noexcept {
    // The lowest numbers are drawn again, as many as would make the first results more likely.
    const std::uint64_t surplus = (0 - bound) % bound;
    std::uint64_t drawn = next();
    while (drawn < surplus)
        drawn = next();
    return drawn % bound;
}

}  // namespace raidsim
