#pragma once

#include <chrono>
#include <cstdint>
#include <functional>
#include <optional>
#include <string>
#include <string_view>

#include "exit_status.h"
#include "library/library.h"

namespace raidinfo {

/// What one check has found.
struct Examined {
    enum class Outcome : std::uint8_t { fine, noteworthy, bad };

    std::string_view key;
    std::string_view title;
    Outcome outcome;
    std::string finding;
    ExitStatus status = ExitStatus::ok;  ///< of the program, where the outcome is bad
};

[[nodiscard]] std::string_view wordOf(Examined::Outcome outcome) noexcept;

/// Looks at everything between the service and the lists, in that order, and hands over each
/// finding as soon as there is one. Ends at the first that is bad, since nothing behind it can
/// work. The service is given up after the limit. Changes the working directory while it runs.
void examine(const Library& library, std::optional<std::chrono::milliseconds> limit,
             const std::function<void(const Examined&)>& tell);

}  // namespace raidinfo
