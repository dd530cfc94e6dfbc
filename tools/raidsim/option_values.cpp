#include "option_values.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <system_error>
#include <utility>

namespace raidsim::forms {

namespace {

using NamedClock = std::pair<const char*, ClockKind>;

constexpr std::array<NamedClock, 2> clocks{{
    {"real", ClockKind::real},
    {"virtual", ClockKind::virtualTime},
}};

}  // namespace

// Empty is what a shell makes of a variable that is not set; it would pass for no file at all. Two
// hyphens begin the next option, where the name was forgotten.
ValueForm<std::string> file() {
    return {"FILE", "no name of a file", [](std::string_view word) -> std::optional<std::string> {
                if (word.empty() || word.starts_with("--"))
                    return std::nullopt;
                return std::string(word);
            }};
}

ValueForm<double> factor() {
    return {"FACTOR", "no number from 0.001 to 1000000",
            [](std::string_view word) -> std::optional<double> {
                double value = 0;
                const char* const end = word.data() + word.size();
                const auto [stop, error] = std::from_chars(word.data(), end, value);
                // Written so that "nan" fails too.
                if (error != std::errc{} || stop != end || !(value >= 0.001 && value <= 1e6))
                    return std::nullopt;
                return value;
            }};
}

ValueForm<std::chrono::sys_seconds> date() {
    return {"DATE", "no time such as 2026-11-21T17:48:00Z", parseUtc};
}

ValueForm<ClockKind> clock() {
    return {"real|virtual", "neither real nor virtual",
            [](std::string_view word) -> std::optional<ClockKind> {
                const auto found = std::ranges::find(clocks, word, &NamedClock::first);
                return found == clocks.end() ? std::nullopt : std::optional{found->second};
            }};
}

std::vector<std::string> clockNames() {
    std::vector<std::string> names;
    for (const auto& [name, kind] : clocks)
        names.emplace_back(name);
    return names;
}

}  // namespace raidsim::forms
