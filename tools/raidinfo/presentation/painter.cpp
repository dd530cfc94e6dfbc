#include "presentation/painter.h"

#include <array>

namespace raidinfo {
namespace {

// In the order of Style: parameters of the control sequence that selects the appearance.
constexpr auto appearances =
    std::to_array<std::string_view>({"", "1", "32", "33", "1;31", "35", "7"});

}  // namespace

std::string Painter::operator()(std::string_view text, Style style) const {
    const std::string_view appearance = appearances.at(static_cast<std::size_t>(style));
    std::string painted{text};
    if (colors && !appearance.empty() && !text.empty()) {
        painted.insert(0, "\x1b[" + std::string{appearance} + "m");
        painted += "\x1b[0m";
    }
    return painted;
}

}  // namespace raidinfo
