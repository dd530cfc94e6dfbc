#pragma once

#include <cstddef>
#include <cstring>
#include <forward_list>
#include <memory_resource>
#include <span>
#include <string_view>
#include <vector>

#include "xml/tag_index.h"
#include "xml/unit.h"

namespace raid::xml {

// What a name is to a class that is not one of its children.
inline constexpr int ownName = -1;
inline constexpr int unknownName = -2;

/// A unit, and what its name is to the class that is being read: the number of a child, or else.
struct NamedUnit {
    Unit unit;
    int number = unknownName;
};

/// A tag, known by its bytes from "<" to ">"; without bytes it is not known yet.
struct KnownTag {
    std::string_view bytes;
    NamedUnit found;

    [[nodiscard]] bool opens(std::string_view text) const noexcept {
        // Without bytes this is the largest number there is.
        return bytes.size() - 1U < text.size() &&
               std::memcmp(bytes.data(), text.data(), bytes.size()) == 0;
    }
};

/// What a class knows of the tags inside its element.
struct Names {
    int (*numberOf)(std::string_view name) = nullptr;
    /// The start tags of the children by number, as far as it is known how the service writes
    /// them, and behind them the end tag of the element.
    std::span<const KnownTag> known;
    TagIndex index;  // of the start tags
};

/// The tags inside the elements of one class, as the document wrote each of them last, and in what
/// order they came. The service repeats the same tags over and over, byte for byte and mostly in
/// the same order, and the same bytes are always the same unit: so most tags need no reading, only
/// a comparison with the tag that followed the last time.
class TagMemory {
public:
    /// The children are expected in the order of their numbers until it is seen otherwise.
    TagMemory(const Names& ofClass, std::pmr::memory_resource* room);
    TagMemory(const TagMemory&) = delete;
    TagMemory& operator=(const TagMemory&) = delete;
    ~TagMemory() = default;

    /// The tag that the text begins with, or null when it has to be read. The text must outlive
    /// the memory; the tag is good until the next call.
    [[nodiscard]] const KnownTag* recall(std::string_view text) noexcept {
        if (auto* const guess = last->follower; guess->opens(text)) [[likely]] {
            last = guess;
            return guess;
        }
        return search(text);
    }

    [[nodiscard]] int numberOf(std::string_view name) const { return names.numberOf(name); }

    /// Remembers how the child with the number of the found unit is written.
    void keep(std::string_view bytes, const NamedUnit& found) noexcept;

    [[nodiscard]] bool isOf(const Names& ofClass) const noexcept { return &names == &ofClass; }

private:
    struct Tag : KnownTag {
        Tag* follower = nullptr;  // the one that came after it the last time
    };

    [[nodiscard]] const KnownTag* search(std::string_view text) noexcept;

    /// Notes that the tag came after the one before it.
    Tag& follow(Tag& tag) noexcept;

    const Names& names;
    std::pmr::vector<Tag> tags;  // in the order of names.known; never moved
    Tag* last;                   // the end of an element is before the beginning of the next
};

/// The tags of all classes of a document.
class TagMemories {
public:
    TagMemories() = default;
    TagMemories(const TagMemories&) = delete;
    TagMemories& operator=(const TagMemories&) = delete;
    ~TagMemories() = default;

    TagMemory& of(const Names& ofClass);

private:
    // Enough for the vocabulary of the configuration, so that it costs one allocation.
    static constexpr std::size_t usualSize = 16 * 1024;

    std::pmr::monotonic_buffer_resource room{usualSize, std::pmr::new_delete_resource()};
    std::pmr::forward_list<TagMemory> memories{&room};
};

}  // namespace raid::xml
