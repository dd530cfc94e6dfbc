#pragma once

#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace raid::fuzz {

/// A unit as the tokenizer is described to read it, with the lines of its trace.
struct DescribedUnit {
    int kind = 0;
    std::string name;
    std::vector<std::pair<std::string, std::string>> attributes;
    bool opening = false;
    bool closing = false;
    int consumed = 0;
    std::vector<std::string> trace;
};

/// The description of the tokenizer taken literally: eleven states, one character at a time,
/// buffers that are appended to. Slow and plain, so that it can be held against the description by
/// eye.
[[nodiscard]] DescribedUnit describedUnit(std::string_view text);

}  // namespace raid::fuzz
