#include "command_line/description.h"

#include <array>
#include <utility>

#include "command_line/subcommands.h"
#include "exit_status.h"

namespace raidinfo {
namespace {

constexpr int defaultLimitSeconds = 60;

constexpr auto footer =
    "The options stand before or behind the subcommand.\n"
    "Exit status: 0 done, 64 wrong usage, 65 a file is wrong, 66 a file cannot be read,\n"
    "69 the service does not answer, 70 internal error, 72 the library cannot be used,\n"
    "73 a file cannot be written, 74 the output cannot be written, 76 malformed answer,\n"
    "130 interrupted. health: 0 ok, 1 warning, 2 critical, 3 unknown. diff: 0 same, 1 different,\n"
    "2 trouble.";

constexpr auto colors = std::to_array<std::pair<const char*, ColorChoice>>({
    {"auto", ColorChoice::automatic},
    {"always", ColorChoice::always},
    {"never", ColorChoice::never},
});

ColorChoice colorNamed(const std::string& word) {
    for (const auto& [name, choice] : colors) {
        if (word == name) {
            return choice;
        }
    }
    throw Failure{ExitStatus::usage, "--color is auto, always or never"};
}

}  // namespace

Description::Description()
    : parser{std::make_unique<CLI::App>(
          "Shows the RAID configuration and the RAID events of this machine.", "raidinfo")} {
    parser->footer(footer);
    parser->require_subcommand(1);
    parser->fallthrough();
    parser->set_version_flag("--version", RAIDINFO_VERSION);
    parser->add_flag("--json", words.json, "Print JSON");
    parser->add_option("--color", words.color, "Colour the output: auto, always or never")
        ->type_name(value_type::when)
        ->default_val("auto")
        ->take_last();
    addFile(*parser, "--from", words.recording, "Read this recording instead of the service");
    addFile(*parser, "--codes", words.codes, "Take the meanings of codes from this file");
    addFile(*parser, "--library", words.library, "Load this library file");
    addNumber(*parser, "--timeout", words.timeout,
              "Give up when the service has not answered after so long; 0 waits for ever",
              "SECONDS", {0, longestSeconds})
        ->default_val(defaultLimitSeconds);
    for (const Subcommand& subcommand : allSubcommands()) {
        CLI::App* const app = parser->add_subcommand(subcommand.name, subcommand.summary);
        subcommand.declare(*app, words);
        const CLI::Option* const kind = app->get_option_no_throw("kind");
        app->footer((kind == nullptr ? "" : "Kinds: " + kindNames() + "\n") + subcommand.examples +
                    "\nOptions that all subcommands have: raidinfo --help");
    }
}

void Description::parse(int argc, const char* const* argv) { parser->parse(argc, argv); }

Options Description::options() const {
    Options options{.json = words.json,
                    .color = colorNamed(words.color),
                    .library = optionalPath(words.library),
                    .recording = optionalPath(words.recording),
                    .codes = optionalPath(words.codes)};
    for (const Subcommand& subcommand : allSubcommands()) {
        const CLI::App* const app = parser->get_subcommand(subcommand.name);
        if (app->parsed()) {
            options.command = subcommand.read(*app, words);
            options.limit = subcommand.limited ? limitOf(words) : std::nullopt;
        }
    }
    return options;
}

std::vector<std::string> colorChoices() {
    std::vector<std::string> names;
    for (const auto& [name, choice] : colors) {
        names.emplace_back(name);
    }
    return names;
}

}  // namespace raidinfo
