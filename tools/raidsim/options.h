#pragma once

#include <chrono>
#include <cstdint>
#include <optional>
#include <stdexcept>
#include <string>
#include <variant>

#include "generate/generate.h"

namespace raidsim {

// What moves the scenario's time: the time of day, or only the operator.
enum class ClockKind { real, virtualTime };

struct Options {
    // Paths; empty: none.
    std::string config;
    std::string replay;
    std::string init;
    std::string scenario;
    std::string fault;
    ClockKind clock = ClockKind::real;
    std::optional<std::chrono::sys_seconds> epoch;
    std::optional<std::uint64_t> seed;
    double speed = 1;
    std::uint16_t port = 34572;
};

// What was asked for instead of a service: help, the version, the completion.
struct Information {
    std::string text;
};

class UsageError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

using Wanted = std::variant<Options, generate::Order, Information>;

// Throws UsageError.
[[nodiscard]] Wanted parseOptions(int argc, const char* const* argv);

}  // namespace raidsim
