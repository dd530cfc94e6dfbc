#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

#include "health/verdict.h"

namespace raidinfo::health {

/// One figure of performance data. A threshold of 0 means that anything above is too much.
struct Measurement {
    std::string_view label;
    std::size_t value = 0;
    std::optional<int> warning = std::nullopt;
    std::optional<int> critical = std::nullopt;
};

/// "'disk drives'=6;;;0": quotes only around labels that need them, and nothing in a label that
/// would end it.
[[nodiscard]] std::string performanceData(const Measurement& measurement);

/// The line of a monitoring plugin: "RAID CRITICAL - text | performance data".
[[nodiscard]] std::string nagiosLine(const Verdict& verdict);

}  // namespace raidinfo::health
