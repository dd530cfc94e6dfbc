#pragma once

#include <array>
#include <cstddef>
#include <functional>
#include <map>
#include <set>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

#include "redact/elements.h"

namespace raidinfo::redact {

/// Gives every original text one replacement, numbered in the order of appearance: "SN-0001". A
/// text of more than 16 bytes gets one that is filled up to the power of two below its length, for
/// that a text is long may be what a recording is about.
class Replacements {
public:
    Replacements() = default;
    Replacements(Replacements&&) = default;
    Replacements& operator=(Replacements&&) = default;
    // What is searched for are the originals in place.
    Replacements(const Replacements&) = delete;
    Replacements& operator=(const Replacements&) = delete;
    ~Replacements() = default;

    /// The replacement of a text, which messages are searched for from now on.
    const std::string& learn(const std::string& original, Sort sort);

    /// The replacement of what may be the beginning of a text only. Messages are not searched for
    /// it.
    const std::string& of(const std::string& original, Sort sort);

    /// A message as it was written, but for the known texts in it. Names are found as whole words,
    /// serial numbers and addresses of four bytes and more anywhere. Where the message is cut off,
    /// it may end with the beginning of a known text.
    [[nodiscard]] std::string message(std::string_view written, bool cutOff);

private:
    struct Known {
        std::string replacement;
        Sort sort{};
        bool searched = false;
    };
    using Originals = std::map<std::string, Known, std::less<>>;
    using Original = Originals::value_type;

    struct Found {
        const Original* original = nullptr;
        std::size_t length = 0;
    };

    Original& known(const std::string& original, Sort sort);
    void search(const Original& original);
    [[nodiscard]] Found at(std::string_view text, std::size_t position) const;
    [[nodiscard]] Found beginningAt(std::string_view text, std::size_t position) const;

    Originals originals;
    std::array<std::size_t, 3> counts{};
    /// What messages are searched for, by its first bytes; and how many these are.
    std::unordered_map<std::string_view, std::vector<const Original*>> searched;
    std::set<std::size_t, std::greater<>> searchedLengths;
};

}  // namespace raidinfo::redact
