#include "options.h"

#include <CLI/CLI.hpp>
#include <array>
#include <string>

#include "exit_status.h"

namespace raidinfo {
namespace {

struct CommandDescription {
    const char* name;
    const char* summary;
    const char* details;
};

// In the order of Command.
constexpr auto commands = std::to_array<CommandDescription>({
    {"list", "Show every list of the inventory with every field",
     "Example: raidinfo list --json | jq '.disk_drives[].serial_number'"},
    {"tree", "Show what belongs to what: adapters, channels, drives, enclosures, arrays",
     "Example: raidinfo tree"},
    {"events", "Follow the controller events until interrupted",
     "Starts with the newest event; ends with status 130 on Ctrl-C.\n"
     "Example: raidinfo events --json | jq -r .message_string"},
});

constexpr auto footer =
    "Exit status: 0 done, 64 wrong usage, 69 the service does not answer, 70 internal error,\n"
    "72 the library cannot be used, 74 the output cannot be written, 76 malformed answer,\n"
    "130 interrupted.";

constexpr auto hint = " (see raidinfo --help)";

constexpr int defaultLimitSeconds = 60;
constexpr int longestLimitSeconds = 86400;

std::string commandNames() {
    std::string names;
    for (const CommandDescription& command : commands) {
        names += (names.empty() ? "" : ", ") + std::string{command.name};
    }
    return names;
}

}  // namespace

std::variant<Options, Information> parseOptions(int argc, const char* const* argv) {
    CLI::App app{"Shows the RAID configuration and the RAID events of this machine.", "raidinfo"};
    app.footer(footer);
    app.require_subcommand(1);
    app.fallthrough();
    app.set_version_flag("--version", RAIDINFO_VERSION);

    Options options;
    std::string library;
    int seconds = defaultLimitSeconds;
    app.add_option("--library", library, "Load this library file")->type_name("PATH")->take_last();
    app.add_option("--timeout", seconds,
                   "Give up when list or tree has no answer after so long; 0 waits for ever")
        ->type_name("SECONDS")
        ->check(CLI::Range(0, longestLimitSeconds).description(""))
        ->take_last()
        ->capture_default_str();
    std::array<CLI::App*, commands.size()> parsed{};
    for (std::size_t index = 0; index < commands.size(); ++index) {
        CLI::App* const command = app.add_subcommand(commands[index].name, commands[index].summary);
        command->footer(commands[index].details);
        command->add_flag("--json", options.json, "Print JSON");
        parsed[index] = command;
    }
    try {
        app.parse(argc, argv);
    } catch (const CLI::CallForHelp&) {
        return Information{app.help()};
    } catch (const CLI::CallForVersion& version) {
        return Information{std::string{"raidinfo "} + version.what() + "\n"};
    } catch (const CLI::RequiredError&) {
        throw Failure{ExitStatus::usage, "expected one of " + commandNames() + hint};
    } catch (const CLI::ParseError& error) {
        throw Failure{ExitStatus::usage, error.what() + std::string{hint}};
    }
    for (std::size_t index = 0; index < parsed.size(); ++index) {
        if (parsed[index]->parsed()) {
            options.command = static_cast<Command>(index);
        }
    }
    if (!library.empty()) {
        options.library = library;
    }
    if (options.command != Command::events && seconds > 0) {
        options.limit = std::chrono::seconds{seconds};
    }
    return options;
}

}  // namespace raidinfo
