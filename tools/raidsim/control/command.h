#pragma once

#include <chrono>
#include <functional>
#include <optional>
#include <stdexcept>
#include <string>
#include <string_view>

namespace raidsim {

class Service;

// A control command that cannot be understood, or not be carried out.
class CommandError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// Where a line comes from.
struct Origin {
    enum class Kind { operatorsLine, file };

    Kind kind = Kind::operatorsLine;
    std::string folder{};  // what a file is named relative to; empty: the working directory
};

struct Outcome {
    std::string message{};  // for the operator; may be empty, or hold several lines
    bool quit = false;
    std::optional<std::chrono::milliseconds> advance{};  // of the scenario's clock
};

// A control command that was understood. Throws CommandError when it cannot be carried out; the
// service then is as before.
using Command = std::function<Outcome(Service&)>;

// Understands a line such as `set adapter:1/channel:1/drive:3 state=4`. A blank line or one
// that starts with "#" gives a command that does nothing. Throws CommandError.
[[nodiscard]] Command parseCommand(std::string_view line, const Origin& origin = {});

// Parses and carries out.
Outcome run(std::string_view line, Service& service);

}  // namespace raidsim
