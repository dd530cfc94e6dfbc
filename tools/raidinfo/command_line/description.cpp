#include "command_line/description.h"

#include <array>
#include <utility>

#include "command_line/subcommands.h"
#include "exit_status.h"

namespace raidinfo {
namespace {

constexpr int defaultLimitSeconds = 60;

std::string footer() {
    std::string text =
        "The options stand before or behind the subcommand. Of several of one name the last one\n"
        "counts, but filters add up.\n\nExit status:\n"
        "  0, 1, 2, 3  health: ok, warning, critical, unknown\n"
        "  0, 1, 2     diff: the same, different, trouble\n";
    for (const auto& [status, code, meaning] : statusWords) {
        const std::string number = std::to_string(static_cast<int>(status));
        text += "  " + number + std::string(12 - number.size(), ' ') + std::string{meaning} + "\n";
    }
    return text + "  130         interrupted; 128 and its number for any other signal";
}

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
    parser->footer(footer());
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
                    .codes = optionalPath(words.codes),
                    .limit = limitOf(words)};
    for (const Subcommand& subcommand : allSubcommands()) {
        const CLI::App* const app = parser->get_subcommand(subcommand.name);
        if (app->parsed()) {
            if (subcommand.withoutRecording != nullptr && options.recording) {
                throw Failure{ExitStatus::usage, subcommand.withoutRecording};
            }
            options.command = subcommand.read(*app, words);
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
