#pragma once

#include <chrono>
#include <cstddef>
#include <functional>
#include <optional>
#include <stdexcept>
#include <string>
#include <string_view>
#include <vector>

#include "control/command.h"

namespace raidsim {

// A script that is not understood; the message names the line.
class ScriptError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// A command of a script file and where it stands.
struct ScriptLine {
    std::size_t number;
    Command command;
};

// A file of control commands, one a line.
[[nodiscard]] std::vector<ScriptLine> parseScript(std::string_view text);

struct ScenarioStep {
    std::chrono::milliseconds at;
    ScriptLine line;
};

// A file of lines `at SECONDS COMMAND` with times that do not decrease.
[[nodiscard]] std::vector<ScenarioStep> parseScenario(std::string_view text);

// Plays steps as the time it is given passes; keeps no clock of its own.
class ScenarioPlayer {
public:
    using Perform = std::function<void(const ScriptLine&)>;

    explicit ScenarioPlayer(std::vector<ScenarioStep> script) : steps(std::move(script)) {}

    // When the next step is due, counted from the start; nothing at the end.
    [[nodiscard]] std::optional<std::chrono::milliseconds> nextDue() const;

    // Performs every step that is due at that time and was not performed yet.
    void advanceTo(std::chrono::milliseconds elapsed, const Perform& perform);

private:
    std::vector<ScenarioStep> steps;
    std::size_t next = 0;
};

}  // namespace raidsim
