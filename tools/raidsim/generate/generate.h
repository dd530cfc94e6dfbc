#pragma once

#include <cstdint>
#include <optional>
#include <string>

#include "generate/sized_rack.h"
#include "xml/tree.h"

namespace raidsim::generate {

// A document to make: the same order gives the same bytes everywhere.
struct Order {
    RackSize rack{};
    std::optional<int> events{};  // an events answer with so many instead of a rack
    xml::Layout layout = xml::Layout::indented;
    std::optional<std::uint32_t> shuffle{};  // the seed of the order of each element's children
};

[[nodiscard]] std::string generate(const Order& order);

}  // namespace raidsim::generate
