#include "xml/tag_memory.h"

#include <algorithm>

namespace raid::xml {

std::size_t TagMemory::bucketOf(std::string_view tag, const Names& names) noexcept {
    constexpr std::uint64_t spread = 0x9E3779B97F4A7C15;  // 2^64 divided by the golden ratio
    std::uint64_t mixed = names.seed;
    for (const auto offset : tellingWords) {
        std::uint64_t word = 0;
        std::memcpy(&word, tag.data() + offset, sizeof word);
        mixed = (mixed ^ word) * spread;
    }
    return static_cast<std::size_t>(mixed >> 0x38U);  // one of 256
}

const TagMemory::Tag* TagMemory::search(std::string_view text, const Names& names) noexcept {
    if (text.size() < shortest) {
        return nullptr;
    }
    searched = &buckets[bucketOf(text, names)];
    for (const auto number : *searched) {
        if (number == 0) {
            break;
        }
        if (auto& tag = tags[number - 1U]; tag.opens(text, names)) {
            return &follow(tag);
        }
    }
    return nullptr;
}

void TagMemory::keep(std::string_view bytes, const Names& names, const NamedUnit& found) {
    if (bytes.size() < shortest || tags.size() == mostTags) {
        return;
    }
    const auto free = std::ranges::find(*searched, 0);
    if (free == searched->end()) {
        return;
    }
    if (tags.empty()) {
        tags.reserve(mostTags);
    }
    auto& tag = tags.emplace_back(Tag{bytes, found, &names, nullptr});
    *free = static_cast<std::uint8_t>(tags.size());
    follow(tag);
}

}  // namespace raid::xml
