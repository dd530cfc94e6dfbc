#pragma once

#include <chrono>
#include <cstdint>
#include <functional>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "options.h"
#include "text.h"

namespace raidsim {

// How the word behind an option becomes its value.
template <typename Value>
struct ValueForm {
    std::string type;   // what the help calls it
    std::string wrong;  // what is said of a word that is none: "... is WRONG"
    std::function<std::optional<Value>(std::string_view)> read;
};

namespace forms {

// From 0 to the most.
template <typename Number>
ValueForm<Number> number(const char* type, std::uint64_t most) {
    return {type, "no number from 0 to " + std::to_string(most),
            [most](std::string_view word) -> std::optional<Number> {
                const auto value = parseCount(word);
                if (!value || *value > most)
                    return std::nullopt;
                return static_cast<Number>(*value);
            }};
}

[[nodiscard]] ValueForm<std::string> file();
[[nodiscard]] ValueForm<double> factor();
[[nodiscard]] ValueForm<std::chrono::sys_seconds> date();
[[nodiscard]] ValueForm<ClockKind> clock();
[[nodiscard]] std::vector<std::string> clockNames();

}  // namespace forms

}  // namespace raidsim
