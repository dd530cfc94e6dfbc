#include "xml/tag_memory.h"

#include <algorithm>

#include "xml/bytes.h"

namespace raid::xml {

TagMemory::TagMemory(const Names& ofClass, std::pmr::memory_resource* room)
    : names(ofClass), tags(ofClass.known.size(), room), last(&tags.back()) {
    for (std::size_t place = 0; place < tags.size(); ++place) {
        static_cast<KnownTag&>(tags[place]) = ofClass.known[place];
        tags[place].follower = &tags[(place + 1) % tags.size()];
    }
}

TagMemory::Tag& TagMemory::follow(Tag& tag) noexcept {
    last->follower = &tag;
    last = &tag;
    return tag;
}

const KnownTag* TagMemory::search(std::string_view text) noexcept {
    if (text.size() < names.index.reach() || text[0] != '<') {
        return nullptr;
    }
    auto& tag = text[1] == '/' ? tags.back() : tags[names.index.candidate(text.data())];
    return tag.opens(text) ? &follow(tag) : nullptr;
}

void TagMemory::keep(std::string_view bytes, const NamedUnit& found) noexcept {
    static_cast<KnownTag&>(follow(tags[static_cast<std::size_t>(found.number)])) = {bytes, found};
}

TagMemory& TagMemories::of(const Names& ofClass) {
    const auto met = std::ranges::find_if(
        memories, [&](const TagMemory& memory) { return memory.isOf(ofClass); });
    return met != memories.end() ? *met : memories.emplace_front(ofClass, &room);
}

}  // namespace raid::xml
