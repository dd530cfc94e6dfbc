#pragma once

#include <cstdint>
#include <initializer_list>

namespace raidsim {

// Random numbers that follow from a place alone, such as a seed, a line and a turn: the same ones
// on every machine and with every library, in whatever order the places are asked.
class Draw {
public:
    explicit Draw(std::initializer_list<std::uint64_t> place) noexcept;

    // Any number.
    [[nodiscard]] std::uint64_t next() noexcept;

    // One below the bound, which is not 0, each as likely as any other.
    [[nodiscard]] std::uint64_t below(std::uint64_t bound) noexcept;

private:
    std::uint64_t state = 0;
};

}  // namespace raidsim
