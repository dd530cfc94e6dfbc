#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <cstring>
#include <string_view>
#include <vector>

#include "xml/unit.h"

namespace raid::xml {

/// How a class numbers the names that it knows.
struct Names {
    int (*numberOf)(std::string_view name) = nullptr;
    std::uint64_t seed = 0;  // another one for each class, so that their tags lie apart
};

/// The seed of the class with that element.
constexpr std::uint64_t seedOf(std::string_view element) noexcept {
    std::uint64_t seed = 0;
    for (const char c : element) {
        seed = seed * 0x83U + static_cast<unsigned char>(c);
    }
    return seed;
}

/// A unit, and the number that its name has for the class that is being read.
struct NamedUnit {
    Unit unit;
    int number = 0;
};

/// The tags of a document that were read so far. The service repeats a few hundred tags over and
/// over, byte for byte and mostly in the same order, and the same bytes are always the same unit:
/// so most tags need no reading, only a comparison with the tag that followed the last time. The
/// text must outlive the memory, and what recall returns lives as long as the memory.
class TagMemory {
public:
    struct Tag {
        std::string_view bytes;  // from "<" to ">"
        NamedUnit found;
        const Names* names = nullptr;
        Tag* follower = nullptr;  // the tag that came after this one the last time

        [[nodiscard]] bool opens(std::string_view text, const Names& asked) const noexcept {
            return bytes.size() <= text.size() && names == &asked &&
                   std::memcmp(bytes.data(), text.data(), bytes.size()) == 0;
        }
    };

    TagMemory() = default;
    TagMemory(const TagMemory&) = delete;
    TagMemory& operator=(const TagMemory&) = delete;
    ~TagMemory() = default;

    /// The tag that the text begins with, or null when it was not seen before.
    [[nodiscard]] const Tag* recall(std::string_view text, const Names& names) noexcept {
        if (expected != nullptr && expected->opens(text, names)) [[likely]] {
            return &pass(*expected);
        }
        return search(text, names);
    }

    /// Remembers the tag at the front of the text that recall did not know last, if there is room.
    /// Tags without attributes are too short to be told apart by their beginning; they are not
    /// kept.
    void keep(std::string_view bytes, const Names& names, const NamedUnit& found);

private:
    // An inventory has some 180 tags of different bytes or classes.
    static constexpr std::size_t mostTags = 255;

    // Where tags begin to differ, and where those with the longest common beginning do.
    static constexpr std::array<std::size_t, 3> tellingWords{4, 12, 16};
    static constexpr std::size_t shortest = tellingWords.back() + sizeof(std::uint64_t);

    /// The numbers of up to four tags, from 1; 0 stands for none.
    using Bucket = std::array<std::uint8_t, 4>;

    [[nodiscard]] static std::size_t bucketOf(std::string_view tag, const Names& names) noexcept;

    [[nodiscard]] const Tag* search(std::string_view text, const Names& names) noexcept;

    const Tag& pass(Tag& tag) noexcept {
        last = &tag;
        expected = tag.follower;
        return tag;
    }

    /// Notes that the tag came after the one before it.
    const Tag& follow(Tag& tag) noexcept {
        if (last != nullptr) {
            last->follower = &tag;
        }
        return pass(tag);
    }

    std::array<Bucket, 256> buckets{};
    Bucket* searched = nullptr;  // where the tag that recall did not know belongs
    std::vector<Tag> tags;       // never moved: all the room is reserved at once
    Tag* last = nullptr;
    Tag* expected = nullptr;
};

}  // namespace raid::xml
