#pragma once

#include <cstdint>
#include <stdexcept>
#include <string>
#include <variant>

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

// Throws UsageError.
[[nodiscard]] std::variant<Options, HelpWanted> parseOptions(int argc, const char* const* argv);

}  // namespace raidsim
