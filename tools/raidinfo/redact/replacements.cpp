#include "redact/replacements.h"

#include <algorithm>
#include <bit>
#include <cctype>

#include "redact/plain_text.h"

namespace raidinfo::redact {
namespace {

struct SortWords {
    std::string_view prefix;
    bool foundInsideWords;
};

constexpr std::array sortWords{
    SortWords{"SN-", true},       // Sort::serialNumber
    SortWords{"ADDRESS-", true},  // Sort::address
    SortWords{"NAME-", false},    // Sort::name
};

constexpr std::size_t shortText = 16;
/// Shorter ones are found inside too many words.
constexpr std::size_t shortestInsideWords = 4;
/// So that a long text costs no more at each place of a message than this.
constexpr std::size_t longestKey = 64;

const SortWords& wordsOf(Sort sort) { return sortWords[static_cast<std::size_t>(sort)]; }

std::string numbered(Sort sort, std::size_t number, std::size_t originalLength) {
    const std::string digits = std::to_string(number);
    std::string text{wordsOf(sort).prefix};
    text.append(digits.size() < 4 ? 4 - digits.size() : 0, '0').append(digits);
    const std::size_t length = originalLength > shortText ? std::bit_floor(originalLength) : 0;
    text.append(length > text.size() ? length - text.size() : 0, '.');
    return text;
}

bool isInWord(char c) {
    const auto byte = static_cast<unsigned char>(c);
    return byte >= 0x80 || std::isalnum(byte) != 0;
}

bool startsWord(std::string_view text, std::size_t position) {
    return position == 0 || !isInWord(text[position - 1]) || !isInWord(text[position]);
}

bool endsWord(std::string_view text, std::size_t end) {
    return end == text.size() || !isInWord(text[end]) || !isInWord(text[end - 1]);
}

bool isFoundInsideWords(Sort sort, std::size_t length) {
    return wordsOf(sort).foundInsideWords && length >= shortestInsideWords;
}

std::size_t agreement(std::string_view left, std::string_view right) {
    const auto mismatch = std::ranges::mismatch(left, right).in1;
    return static_cast<std::size_t>(mismatch - left.begin());
}

}  // namespace

Replacements::Original& Replacements::known(const std::string& original, Sort sort) {
    const auto [found, isNew] = originals.try_emplace(original);
    if (isNew) {
        const std::size_t number = ++counts.at(static_cast<std::size_t>(sort));
        found->second = {numbered(sort, number, original.size()), sort};
    }
    return *found;
}

const std::string& Replacements::of(const std::string& original, Sort sort) {
    return known(original, sort).second.replacement;
}

const std::string& Replacements::learn(const std::string& original, Sort sort) {
    Original& entry = known(original, sort);
    if (!entry.second.searched) {
        entry.second.searched = true;
        search(entry);
    }
    return entry.second.replacement;
}

void Replacements::search(const Original& original) {
    const std::string_view key = std::string_view{original.first}.substr(0, longestKey);
    searched[key].push_back(&original);
    searchedLengths.insert(key.size());
}

/// The longest known text that stands there. Of one that is longer than its key, a part counts,
/// too.
Replacements::Found Replacements::at(std::string_view text, std::size_t position) const {
    const std::string_view rest = text.substr(position);
    for (const std::size_t keyLength : searchedLengths) {
        const auto candidates = searched.find(rest.substr(0, keyLength));
        if (keyLength > rest.size() || candidates == searched.end()) {
            continue;
        }
        Found longest;
        for (const Original* const candidate : candidates->second) {
            const std::size_t length = agreement(rest, candidate->first);
            const bool stands = isFoundInsideWords(candidate->second.sort, length) ||
                                (startsWord(text, position) && endsWord(text, position + length));
            if (stands && length > longest.length) {
                longest = {candidate, length};
            }
        }
        if (longest.original != nullptr) {
            return longest;
        }
    }
    return {};
}

/// The known text that begins with all that is left from there on.
Replacements::Found Replacements::beginningAt(std::string_view text, std::size_t position) const {
    const std::string_view rest = text.substr(position);
    if (rest.size() >= longestKey) {
        return {};  // as much of a text is found by its key
    }
    const auto candidate = originals.lower_bound(rest);
    if (candidate == originals.end() || !candidate->first.starts_with(rest)) {
        return {};
    }
    const bool stands =
        isFoundInsideWords(candidate->second.sort, rest.size()) || startsWord(text, position);
    return stands ? Found{&*candidate, rest.size()} : Found{};
}

std::string Replacements::message(std::string_view written, bool cutOff) {
    const PlainText plain{written};
    const std::string& text = plain.text();
    std::string result;
    std::size_t position = 0;
    while (position < text.size()) {
        if (const Found found = at(text, position); found.original != nullptr) {
            result += found.original->second.replacement;
            position += found.length;
        } else if (const Found beginning = cutOff ? beginningAt(text, position) : Found{};
                   beginning.original != nullptr) {
            result += of(text.substr(position), beginning.original->second.sort);
            position = text.size();
        } else {
            result += plain.written(position, position + 1);
            ++position;
        }
    }
    return result;
}

}  // namespace raidinfo::redact
