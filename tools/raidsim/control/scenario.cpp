#include "control/scenario.h"

#include <algorithm>
#include <utility>

#include "text.h"

namespace raidsim {

namespace {

// Calls use(number, line) for every line that is neither blank nor a comment.
template <typename Use>
void forEachLine(std::string_view text, Use use) {
    std::size_t number = 0;
    for (const std::string_view raw : split(text, '\n')) {
        ++number;
        const std::string_view line = trim(raw);
        if (line.empty() || line.starts_with('#'))
            continue;
        try {
            use(number, line);
        } catch (const CommandError& error) {
            throw ScriptError("line " + std::to_string(number) + ": " + error.what());
        }
    }
}

// The word at the start of the rest, which is cut off with the blanks around it.
std::string_view takeWord(std::string_view& rest) {
    const auto end = std::min(rest.find_first_of(" \t"), rest.size());
    const std::string_view word = rest.substr(0, end);
    rest = trim(rest.substr(end));
    return word;
}

std::chrono::milliseconds parseTime(std::string_view word) {
    const auto time = parseSeconds(word);
    if (!time)
        throw CommandError("\"" + std::string(word) + "\" is not a time in seconds");
    return *time;
}

}  // namespace

std::vector<ScriptLine> parseScript(std::string_view text) {
    std::vector<ScriptLine> script;
    forEachLine(text, [&](std::size_t number, std::string_view line) {
        script.push_back({number, parseCommand(line)});
    });
    return script;
}

std::vector<ScenarioStep> parseScenario(std::string_view text) {
    std::vector<ScenarioStep> steps;
    forEachLine(text, [&](std::size_t number, std::string_view line) {
        if (takeWord(line) != "at")
            throw CommandError("a step starts with \"at SECONDS\"");
        const std::chrono::milliseconds at = parseTime(takeWord(line));
        if (!steps.empty() && at < steps.back().at)
            throw CommandError("the step lies before the one above it");
        if (line.empty())
            throw CommandError("the step has no command");
        steps.push_back({at, {number, parseCommand(line)}});
    });
    return steps;
}

std::optional<std::chrono::milliseconds> ScenarioPlayer::nextDue() const {
    if (next == steps.size())
        return std::nullopt;
    return steps[next].at;
}

void ScenarioPlayer::advanceTo(std::chrono::milliseconds elapsed, const Perform& perform) {
    while (next < steps.size() && steps[next].at <= elapsed) {
        const ScriptLine& line = steps[next].line;
        ++next;
        perform(line);
    }
}

}  // namespace raidsim
