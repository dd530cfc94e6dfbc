#pragma once

#include <chrono>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <optional>
#include <stdexcept>
#include <string>
#include <string_view>
#include <vector>

#include "control/command.h"
#include "control/schedule.h"

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

// A file of control commands, one a line. Files are named in it relative to the folder.
[[nodiscard]] std::vector<ScriptLine> parseScript(std::string_view text,
                                                  const std::string& folder = {});

// What is carried out once or again and again.
struct Step {
    std::size_t line;  // 0: of no file
    Schedule schedule;
    std::function<Command(std::uint64_t turn)> commandAt;
};

struct Scenario {
    std::string config;  // the path of the document to begin with; empty: not named
    std::optional<std::chrono::sys_seconds> start;
    std::vector<Step> steps;  // in the order in which they are due first
};

// A file of statements, as docs/scenarios.md describes it. Files are named in it relative to the
// folder. The seed, when given, is used in place of the file's own. Throws ScriptError.
[[nodiscard]] Scenario parseScenario(std::string_view text, const std::string& folder = {},
                                     std::optional<std::uint64_t> seed = {});

}  // namespace raidsim
