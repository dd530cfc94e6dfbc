#pragma once

#include <cstdint>
#include <string>
#include <string_view>

namespace raidinfo {

/// Why a text is emphasised. The text always says the same in words.
enum class Style : std::uint8_t { plain, heading, good, warning, critical, unknown, changed };

/// Colours texts for a terminal, or leaves them alone.
class Painter {
public:
    explicit Painter(bool withColors) : colors{withColors} {}

    [[nodiscard]] std::string operator()(std::string_view text, Style style) const;

private:
    bool colors;
};

}  // namespace raidinfo
