#pragma once

#include <functional>
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

struct Outcome {
    std::string message;  // for the operator; may be empty, or hold several lines
    bool quit = false;
};

// A control command that was understood. Throws CommandError when it cannot be carried out; the
// service then is as before.
using Command = std::function<Outcome(Service&)>;

// Understands a line such as `set adapter:1/channel:1/drive:3 state=4`. A blank line or one
// that starts with "#" gives a command that does nothing. Throws CommandError.
[[nodiscard]] Command parseCommand(std::string_view line);

// Parses and carries out.
Outcome run(std::string_view line, Service& service);

}  // namespace raidsim
