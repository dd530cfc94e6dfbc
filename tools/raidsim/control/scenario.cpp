#include "control/scenario.h"

#include <algorithm>
#include <array>
#include <set>
#include <utility>

#include "bounds.h"
#include "control/template.h"
#include "control/words.h"
#include "files.h"
#include "text.h"

namespace raidsim {

namespace {

constexpr bool isControl(char c) noexcept { return c >= '\0' && c < ' ' && c != '\t'; }

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
            if (std::ranges::any_of(line, isControl))
                throw CommandError("a control character");
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

bool takeIf(std::string_view& rest, std::string_view wanted) {
    std::string_view behind = rest;
    if (takeWord(behind) != wanted)
        return false;
    rest = behind;
    return true;
}

std::chrono::milliseconds takeTime(std::string_view& rest) {
    const std::string_view word = takeWord(rest);
    const auto time = parseSeconds(word);
    if (!time)
        throw CommandError("\"" + std::string(word) + "\" is not " + std::string(secondsForm));
    return *time;
}

std::uint64_t takeTurns(std::string_view& rest) {
    const std::string_view word = takeWord(rest);
    const auto turns = parseCount(word);
    if (!turns || *turns == 0 || *turns > bounds::turnsOfAStep) {
        throw CommandError("\"" + std::string(word) + "\" is not a number of times, 1 to " +
                           std::to_string(bounds::turnsOfAStep));
    }
    return *turns;
}

class ScenarioReader {
public:
    ScenarioReader(const std::string& folder, std::optional<std::uint64_t> givenSeed)
        : origin{Origin::Kind::file, folder},
          seedIsGiven(givenSeed.has_value()),
          seed(givenSeed.value_or(0)) {}

    void take(std::size_t number, std::string_view text) {
        const std::string line = names.replacedIn(text);
        std::string_view rest = line;
        const std::string name(takeWord(rest));
        const auto statement = std::ranges::find(statements, name, &Statement::name);
        if (statement == statements.end()) {
            throw CommandError("unknown statement \"" + name +
                               "\"; a step starts with \"at SECONDS\" or \"from SECONDS\"");
        }
        if (statement->heads && !made.steps.empty())
            throw CommandError("\"" + name + "\" stands before the first step");
        if (statement->heads && !heads.insert(name).second)
            throw CommandError("there are two lines \"" + name + "\"");
        lineNumber = number;
        if (!(this->*statement->read)(rest))
            throw CommandError("usage: " + name + " " + std::string(statement->arguments));
    }

    Scenario finish() { return std::move(made); }

private:
    // Reads what is behind the name; false: it is not of the form.
    using Read = bool (ScenarioReader::*)(std::string_view rest);

    struct Statement {
        std::string_view name;
        std::string_view arguments;
        Read read;
        bool heads = false;  // once, before the first step
    };

    bool readConfig(std::string_view rest) {
        const auto words = splitWords(rest);
        if (words.size() == 1)
            made.config = pathFrom(origin.folder, words[0]);
        return words.size() == 1;
    }

    bool readStart(std::string_view rest) {
        made.start = parseUtc(rest);
        return made.start.has_value();
    }

    bool readSeed(std::string_view rest) {
        const auto number = parseCount(rest);
        if (number && !seedIsGiven)
            seed = *number;
        return number.has_value();
    }

    bool readLet(std::string_view rest) {
        const std::string name(takeWord(rest));
        if (!rest.empty())
            names.define(name, std::string(rest));
        return !rest.empty();
    }

    bool readAt(std::string_view rest) {
        Schedule schedule;
        schedule.first = schedule.last = takeTime(rest);
        if (takeIf(rest, "times"))
            schedule.turns = takeTurns(rest);
        addStep(schedule, rest);
        return true;
    }

    bool readFrom(std::string_view rest) {
        Schedule schedule;
        schedule.first = takeTime(rest);
        if (!takeIf(rest, "to"))
            return false;
        schedule.last = takeTime(rest);
        if (schedule.last < schedule.first)
            throw CommandError("the step ends before it begins");
        if (takeIf(rest, "every")) {
            repeatEvery(schedule, takeTime(rest));
        } else if (takeIf(rest, "times")) {
            schedule.turns = takeTurns(rest);
        } else {
            return false;
        }
        if (takeIf(rest, "jitter"))
            schedule.jitter = takeTime(rest);
        if (schedule.jitter > schedule.gap())
            throw CommandError("the jitter is longer than the time between two turns");
        addStep(schedule, rest);
        return true;
    }

    static void repeatEvery(Schedule& schedule, std::chrono::milliseconds gap) {
        const auto span = schedule.last - schedule.first;
        if (gap.count() == 0 || static_cast<std::uint64_t>(span / gap) >= bounds::turnsOfAStep) {
            throw CommandError("the step would be carried out more than " +
                               std::to_string(bounds::turnsOfAStep) + " times");
        }
        schedule.turns = static_cast<std::uint64_t>(span / gap) + 1;
        schedule.last -= span % gap;
    }

    void addStep(Schedule schedule, std::string_view line) {
        if (!made.steps.empty() && schedule.first < made.steps.back().schedule.first)
            throw CommandError("the step lies before the one above it");
        if (line.empty())
            throw CommandError("the step has no command");
        schedule.seed = seed;
        schedule.step = made.steps.size();
        const Template command = Template::parse(line);
        Command sample;
        for (const std::string& each : command.samples(schedule.turns))
            sample = parseCommand(each, origin);
        if (!command.varies()) {
            made.steps.push_back(
                {lineNumber, schedule, [sample](std::uint64_t) { return sample; }});
            return;
        }
        made.steps.push_back(
            {lineNumber, schedule, [command, schedule, from = origin](std::uint64_t turn) {
                 const Turn which{turn, schedule.turns};
                 return parseCommand(command.at(which, schedule.choices(turn)), from);
             }});
    }

    static const std::array<Statement, 6> statements;

    Origin origin;
    bool seedIsGiven;
    std::uint64_t seed;
    Names names;
    std::set<std::string> heads;  // that were read
    std::size_t lineNumber = 0;
    Scenario made;
};

constexpr std::array<ScenarioReader::Statement, 6> ScenarioReader::statements{{
    {"config", "FILE", &ScenarioReader::readConfig, true},
    {"start", "YYYY-MM-DDTHH:MM:SSZ", &ScenarioReader::readStart, true},
    {"seed", "NUMBER", &ScenarioReader::readSeed, true},
    {"let", "NAME VALUE", &ScenarioReader::readLet},
    {"at", "SECONDS [times NUMBER] COMMAND", &ScenarioReader::readAt},
    {"from", "SECONDS to SECONDS every SECONDS|times NUMBER [jitter SECONDS] COMMAND",
     &ScenarioReader::readFrom},
}};

}  // namespace

std::vector<ScriptLine> parseScript(std::string_view text, const std::string& folder) {
    const Origin origin{Origin::Kind::file, folder};
    std::vector<ScriptLine> script;
    forEachLine(text, [&](std::size_t number, std::string_view line) {
        script.push_back({number, parseCommand(line, origin)});
    });
    return script;
}

Scenario parseScenario(std::string_view text, const std::string& folder,
                       std::optional<std::uint64_t> seed) {
    ScenarioReader reader(folder, seed);
    forEachLine(text,
                [&](std::size_t number, std::string_view line) { reader.take(number, line); });
    return reader.finish();
}

}  // namespace raidsim
