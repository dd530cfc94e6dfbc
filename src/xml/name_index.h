#pragma once

#include <array>
#include <bit>
#include <cstddef>
#include <cstdint>
#include <string_view>

namespace raid::xml {

/// Finds names among those that are known when the library is compiled.
template <std::size_t Count>
class NameIndex {
public:
    constexpr explicit NameIndex(const std::array<std::string_view, Count>& known) noexcept
        : names(known) {
        for (std::size_t i = 0; i < Count; ++i) {
            auto slot = slotOf(names[i]);
            while (slots[slot] != 0) {
                slot = following(slot);
            }
            slots[slot] = static_cast<std::uint8_t>(i + 1);
        }
    }

    /// The place of the name among those known; Count for any other name.
    [[nodiscard]] constexpr std::size_t find(std::string_view name) const noexcept {
        for (auto slot = slotOf(name); slots[slot] != 0; slot = following(slot)) {
            if (const std::size_t place = slots[slot] - 1U; names[place] == name) {
                return place;
            }
        }
        return Count;
    }

private:
    // At most a quarter is taken, so that a search soon meets a free slot.
    static constexpr std::size_t slotCount = std::bit_ceil(Count * 4);
    static_assert(Count < 256);

    static constexpr std::size_t slotOf(std::string_view name) noexcept {
        if (name.empty()) {
            return 0;
        }
        // Where names with the same beginning or the same end differ.
        const auto letter = [name](std::size_t place) {
            return static_cast<std::size_t>(static_cast<unsigned char>(name[place]));
        };
        const std::size_t mixed = name.size() + letter(name.size() / 3) * 0x5U +
                                  letter(name.size() / 2) * 0x1FU + letter(name.size() - 1) * 0x3DU;
        return mixed % slotCount;
    }

    static constexpr std::size_t following(std::size_t slot) noexcept {
        return (slot + 1) % slotCount;
    }

    std::array<std::string_view, Count> names;
    std::array<std::uint8_t, slotCount> slots{};  // places counted from 1; 0 is free
};

}  // namespace raid::xml
