#include "control/command.h"

#include <algorithm>
#include <array>
#include <limits>
#include <memory>
#include <optional>
#include <utility>

#include "control/words.h"
#include "files.h"
#include "service.h"
#include "state/edit.h"
#include "text.h"

namespace raidsim {

namespace {

using Words = std::vector<std::string>;

Fields parseFields(const Words& words, std::size_t first) {
    Fields fields;
    for (std::size_t i = first; i < words.size(); ++i) {
        const auto equals = words[i].find('=');
        if (equals == std::string::npos || equals == 0)
            throw CommandError("\"" + words[i] + "\" is not of the form field=value");
        fields.emplace_back(words[i].substr(0, equals), words[i].substr(equals + 1));
    }
    return fields;
}

Command makeEvent(const Words& words) {
    Fields fields = parseFields(words, 0);
    EventLog::check(fields);
    return [fields = std::move(fields)](Service& service) {
        service.addEvent(fields);
        return Outcome{};
    };
}

Command makeSet(const Words& words) {
    return [path = Path::parse(words[0]), fields = parseFields(words, 1)](Service& service) {
        setFields(service.document(), path, fields);
        return Outcome{};
    };
}

Command makeProgress(const Words& words) {
    const Path path = Path::parse(words[0]);
    if (words[1] == "done") {
        return [path](Service& service) {
            clearProgress(service.document(), path);
            return Outcome{};
        };
    }
    const std::optional<int> percent = parseInt(words[1]);
    if (!percent || *percent < 0 || *percent > 100)
        throw CommandError("\"" + words[1] + "\" is neither a percentage nor \"done\"");
    return [path, percent = *percent](Service& service) {
        setProgress(service.document(), path, percent);
        return Outcome{};
    };
}

template <void (*change)(Document&, const Path&, const Path&)>
Command makeMembership(const Words& words) {
    return [drive = Path::parse(words[0]), target = Path::parse(words[1])](Service& service) {
        change(service.document(), drive, target);
        return Outcome{};
    };
}

Command makeReload(const Words& words) {
    return [path = words.empty() ? std::string() : words[0]](Service& service) {
        const std::string source = path.empty() ? service.documentPath() : path;
        try {
            service.reload(path);
        } catch (const std::runtime_error& error) {
            throw CommandError(source + ": " + error.what() + "; the old document stays");
        }
        return Outcome{"serving " + source};
    };
}

// `fault FILE [CASE]` or `fault off`
Command makeFault(const Words& words) {
    if (words.size() == 1 && words[0] == "off") {
        return [](Service& service) {
            service.faults().off();
            return Outcome{"fault: off"};
        };
    }
    const auto file = std::make_shared<const FaultFile>(words[0]);
    const auto number = words.size() > 1 ? parseInt(words[1]) : std::nullopt;
    if (words.size() > 1 && (!number || *number < 0))
        throw CommandError("\"" + words[1] + "\" is not the number of a case");
    return [file, number](Service& service) {
        const auto only = number ? std::optional(static_cast<std::size_t>(*number)) : std::nullopt;
        service.faults().arm(file, only);
        return Outcome{"fault: armed " + file->name()};
    };
}

Command makeStatus(const Words&) {
    return [](Service& service) {
        const EventLog& log = service.events();
        return Outcome{"document " + service.documentPath() + ", events " +
                       std::to_string(log.size()) + ", newest " + std::to_string(log.newest()) +
                       ", waiting clients " + std::to_string(log.waiting())};
    };
}

Command makeHelp(const Words&);

Command makeQuit(const Words&) {
    return [](Service&) { return Outcome{{}, true}; };
}

struct Entry {
    std::string_view name;
    std::string_view arguments;
    std::size_t least;
    std::size_t most;
    Command (*make)(const Words& arguments);
};

constexpr std::size_t anyNumber = std::numeric_limits<std::size_t>::max();

constexpr std::array<Entry, 10> commands{{
    {"event", "field=value...", 1, anyNumber, makeEvent},
    {"set", "PATH field=value...", 2, anyNumber, makeSet},
    {"progress", "PATH PERCENT|done", 2, 2, makeProgress},
    {"join", "DRIVE-PATH ARRAY-OR-SPARES-PATH", 2, 2, makeMembership<join>},
    {"leave", "DRIVE-PATH ARRAY-OR-SPARES-PATH", 2, 2, makeMembership<leave>},
    {"reload", "[FILE]", 0, 1, makeReload},
    {"fault", "FILE [CASE] | off", 1, 2, makeFault},
    {"status", "", 0, 0, makeStatus},
    {"help", "", 0, 0, makeHelp},
    {"quit", "", 0, 0, makeQuit},
}};

std::string usage(const Entry& entry) {
    std::string text(entry.name);
    if (!entry.arguments.empty())
        text.append(1, ' ').append(entry.arguments);
    return text;
}

Command makeHelp(const Words&) {
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

// The layers below have errors of their own; to the operator they all mean the command.
template <typename Action>
auto asCommand(std::string_view name, Action action) {
    try {
        return action();
    } catch (const std::runtime_error& error) {
        throw CommandError(std::string(name) + ": " + error.what());
    }
}

}  // namespace

Command parseCommand(std::string_view line) {
    if (trim(line).empty() || trim(line).starts_with('#'))
        return [](Service&) { return Outcome{}; };
    Words words = splitWords(line);
    const std::string name = words.front();
    words.erase(words.begin());
    const auto entry = std::ranges::find(commands, name, &Entry::name);
    if (entry == commands.end())
        throw CommandError("unknown command \"" + name + "\"");
    if (words.size() < entry->least || words.size() > entry->most)
        throw CommandError("usage: " + usage(*entry));
    return asCommand(entry->name, [&]() -> Command {
        return [name = entry->name, action = entry->make(words)](Service& service) {
            return asCommand(name, [&] { return action(service); });
        };
    });
}

Outcome run(std::string_view line, Service& service) { return parseCommand(line)(service); }

}  // namespace raidsim
