#include "control/command.h"

#include <algorithm>
#include <array>
#include <limits>
#include <utility>

#include "control/makers.h"
#include "control/words.h"
#include "text.h"

namespace raidsim {

namespace {

// Who may give a command.
enum class For { all, operatorOnly };

struct Entry {
    std::string_view name;
    std::string_view arguments;
    std::size_t least;
    std::size_t most;
    Command (*make)(const makers::Arguments& arguments);
    For whom = For::all;
};

constexpr std::size_t anyNumber = std::numeric_limits<std::size_t>::max();

Command makeHelp(const makers::Arguments&);

constexpr std::array<Entry, 16> commands{{
    {"event", "[place=last|first|before:N|after:N] field=value...", 1, anyNumber, makers::event},
    {"set", "PATH field=value...", 2, anyNumber, makers::set},
    {"progress", "PATH PERCENT|done", 2, 2, makers::progress},
    {"join", "DRIVE-PATH ARRAY-OR-SPARES-PATH", 2, 2, makers::join},
    {"leave", "DRIVE-PATH ARRAY-OR-SPARES-PATH", 2, 2, makers::leave},
    {"add", "PATH like PATH | from FILE [field=value...]", 3, anyNumber, makers::add},
    {"remove", "PATH", 1, 1, makers::remove},
    {"forget", "[NUMBER]", 0, 1, makers::forget},
    {"reload", "[FILE]", 0, 1, makers::reload},
    {"fault", "FILE [CASE] | off", 1, 2, makers::fault},
    {"down", "", 0, 0, makers::down},
    {"up", "", 0, 0, makers::up},
    {"advance", "SECONDS", 1, 1, makers::advance, For::operatorOnly},
    {"status", "", 0, 0, makers::status},
    {"help", "", 0, 0, makeHelp},
    {"quit", "", 0, 0, makers::quit},
}};

std::string usage(const Entry& entry) {
    std::string text(entry.name);
    if (!entry.arguments.empty())
        text.append(1, ' ').append(entry.arguments);
    return text;
}

Command makeHelp(const makers::Arguments&) {
    return [](Service&) {
        Outcome outcome;
        for (const Entry& entry : commands) {
            if (!outcome.message.empty())
                outcome.message += '\n';
            outcome.message += usage(entry);
        }
        return outcome;
    };
}

}  // namespace

Command parseCommand(std::string_view line, const Origin& origin) {
    if (trim(line).empty() || trim(line).starts_with('#'))
        return [](Service&) { return Outcome{}; };
    makers::Arguments arguments{splitWords(line), origin};
    const std::string name = arguments.words.front();
    arguments.words.erase(arguments.words.begin());
    const auto entry = std::ranges::find(commands, name, &Entry::name);
    if (entry == commands.end())
        throw CommandError("unknown command \"" + name + "\"");
    if (arguments.words.size() < entry->least || arguments.words.size() > entry->most)
        throw CommandError("usage: " + usage(*entry));
    if (entry->whom == For::operatorOnly && origin.kind == Origin::Kind::file)
        throw CommandError(name + ": only the operator can say that");
    // The layers below have errors of their own; to the operator they all mean the command.
    return makers::about(entry->name, [&]() -> Command {
        return [name = entry->name, action = entry->make(arguments)](Service& service) {
            return makers::about(name, [&] { return action(service); });
        };
    });
}

Outcome run(std::string_view line, Service& service) { return parseCommand(line)(service); }

}  // namespace raidsim
