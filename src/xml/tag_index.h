#pragma once

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <span>
#include <string_view>

namespace raid::xml {

/// Which of some tags a text may begin with, by two of its bytes: those that tell the tags apart
/// best, chosen when the library is compiled.
class TagIndex {
public:
    /// By the tags or, where only that is known, their beginnings; at most 256 of them.
    constexpr explicit TagIndex(std::span<const std::string_view> tags) noexcept {
        for (const auto tag : tags) {
            shortest = std::min(shortest, tag.size());
        }
        std::size_t fewest = tags.size() + 1;
        for (std::size_t one = 0; one < shortest; ++one) {
            for (std::size_t other = 0; other < one && fewest > 0; ++other) {
                TagIndex tried = *this;
                tried.first = one;
                tried.second = other;
                if (const auto collisions = tried.fill(tags); collisions < fewest) {
                    fewest = collisions;
                    *this = tried;
                }
            }
        }
    }

    /// The bytes that a text must have at least.
    [[nodiscard]] constexpr std::size_t reach() const noexcept { return shortest; }

    /// The place of the tag that the text may begin with; of the first where two are not told
    /// apart.
    [[nodiscard]] constexpr std::size_t candidate(const char* text) const noexcept {
        return places[slotOf(text)];
    }

private:
    [[nodiscard]] constexpr std::size_t slotOf(const char* text) const noexcept {
        const auto byte = [text](std::size_t at) {
            return static_cast<std::size_t>(static_cast<unsigned char>(text[at]));
        };
        // By an odd factor, so that two bytes that are exchanged make another sum.
        return (byte(first) * 0x25U + byte(second)) % slots;
    }

    /// Returns how many tags found their slot taken.
    constexpr std::size_t fill(std::span<const std::string_view> tags) noexcept {
        std::array<bool, slots> taken{};
        std::size_t collisions = 0;
        for (std::size_t place = 0; place < tags.size(); ++place) {
            const auto slot = slotOf(tags[place].data());
            if (taken[slot]) {
                ++collisions;
            } else {
                taken[slot] = true;
                places[slot] = static_cast<std::uint8_t>(place);
            }
        }
        return collisions;
    }

    static constexpr std::size_t slots = 256;

    // Behind that the tags differ no more, and every pair before it is tried.
    static constexpr std::size_t furthest = 32;

    std::size_t shortest = furthest;
    std::size_t first = 0;
    std::size_t second = 0;
    std::array<std::uint8_t, slots> places{};
};

}  // namespace raid::xml
