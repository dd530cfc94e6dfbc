#include "flat/packing.h"

#include <cstdint>
#include <cstring>

namespace {

enum class Tag : std::uint32_t { integer = 0, string = 1, integers = 2, strings = 3 };

static_assert(__BYTE_ORDER__ == __ORDER_LITTLE_ENDIAN__, "packed words are little-endian");

template <class Word>
void* put(void* buffer, Word word) {
    static_assert(sizeof word == 4);
    std::memcpy(buffer, &word, sizeof word);
    return static_cast<char*>(buffer) + sizeof word;
}

template <class Values, class Pack>
void* packEach(void* buffer, Tag tag, const Values& values, Pack pack) {
    buffer = put(put(buffer, tag), static_cast<std::uint32_t>(values.size()));
    for (const auto& value : values) {
        buffer = pack(buffer, value);
    }
    return buffer;
}

}  // namespace

void* packI(void* buffer, int value) { return put(put(buffer, Tag::integer), value); }

// Callers outside were built with strings and vectors passed by value.
// NOLINTBEGIN(performance-unnecessary-value-param)

void* packS(void* buffer, std::string value) {
    buffer = put(put(buffer, Tag::string), static_cast<std::uint32_t>(value.size()));
    auto* const characters = static_cast<char*>(buffer);
    std::strcpy(characters, value.c_str());
    return characters + value.size() + 1;
}

void* packAI(void* buffer, std::vector<int> values) {
    return packEach(buffer, Tag::integers, values, packI);
}

void* packAS(void* buffer, std::vector<std::string> values) {
    return packEach(buffer, Tag::strings, values, packS);
}

// NOLINTEND(performance-unnecessary-value-param)
