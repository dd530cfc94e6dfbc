#pragma once

#include <cstdint>
#include <stdexcept>
#include <string>
#include <variant>

#include "generate/generate.h"

namespace raidsim {

struct Options {
    std::string config;
    std::string init;      // empty: none
    std::string scenario;  // empty: none
    std::string fault;     // empty: none
    double speed = 1;
    std::uint16_t port = 34572;
};

struct HelpWanted {
    std::string text;
};

class UsageError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

using Wanted = std::variant<Options, generate::Order, HelpWanted>;

// Throws UsageError.
[[nodiscard]] Wanted parseOptions(int argc, const char* const* argv);

}  // namespace raidsim
