#pragma once

#include <stdexcept>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "control/command.h"

// What the table of commands is made of: each makes a command of the words behind its name. They
// may throw any std::runtime_error, which becomes a CommandError with the command's name in front.
namespace raidsim::makers {

struct Arguments {
    std::vector<std::string> words;
    const Origin& origin;

    // The words from the first one on, each field=value.
    [[nodiscard]] std::vector<std::pair<std::string, std::string>> fields(std::size_t first) const;
    // The path of a file as the operator, or the file that holds the line, names it.
    [[nodiscard]] std::string file(std::size_t index) const;
};

// Does something, and puts what it is about in front of any error.
template <typename Action>
auto about(std::string_view what, Action action) {
    try {
        return action();
    } catch (const std::runtime_error& error) {
        throw CommandError(std::string(what) + ": " + error.what());
    }
}

// The document.
[[nodiscard]] Command set(const Arguments& arguments);
[[nodiscard]] Command progress(const Arguments& arguments);
[[nodiscard]] Command join(const Arguments& arguments);
[[nodiscard]] Command leave(const Arguments& arguments);
[[nodiscard]] Command add(const Arguments& arguments);
[[nodiscard]] Command remove(const Arguments& arguments);
[[nodiscard]] Command reload(const Arguments& arguments);

// The events.
[[nodiscard]] Command event(const Arguments& arguments);
[[nodiscard]] Command forget(const Arguments& arguments);

// The service as a whole.
[[nodiscard]] Command fault(const Arguments& arguments);
[[nodiscard]] Command down(const Arguments& arguments);
[[nodiscard]] Command up(const Arguments& arguments);
[[nodiscard]] Command advance(const Arguments& arguments);
[[nodiscard]] Command status(const Arguments& arguments);
[[nodiscard]] Command quit(const Arguments& arguments);

}  // namespace raidsim::makers
