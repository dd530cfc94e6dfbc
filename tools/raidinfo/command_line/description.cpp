#include "command_line/description.h"

#include <algorithm>
#include <array>
#include <limits>
#include <utility>

#include "exit_status.h"

namespace raidinfo {
namespace {

constexpr int defaultLimitSeconds = 60;
constexpr int longestSeconds = 86400;
constexpr int largest = std::numeric_limits<int>::max();

/// A subcommand: its name, its help, its options, and what is made of them.
struct Subcommand {
    const char* name;
    const char* summary;
    const char* examples;
    void (*declare)(CLI::App&, Words&);
    CommandOptions (*read)(const CLI::App&, const Words&);
    bool limited = true;  ///< --timeout counts
};

const Kind* kindNamed(const std::string& key) {
    const Kind* const kind = findInventoryKind(key);
    if (kind == nullptr) {
        throw Failure{ExitStatus::usage,
                      "\"" + key + "\" is no kind of record; there are " + kindNames()};
    }
    return kind;
}

std::optional<Path> optionalPath(const std::string& word) {
    return word.empty() ? std::nullopt : std::optional<Path>{word};
}

std::optional<int> optionalNumber(const CLI::App& app, const char* option, int value) {
    return app.count(option) == 0 ? std::nullopt : std::optional{value};
}

std::optional<std::chrono::milliseconds> limitOf(const Words& words) {
    return words.timeout == 0
               ? std::nullopt
               : std::optional<std::chrono::milliseconds>{std::chrono::seconds{words.timeout}};
}

CLI::Validator between(int least, int most) { return CLI::Range(least, most).description(""); }

/// Refuses what a shell makes of a variable that is not set: it would pass for no value at all.
CLI::Validator notEmpty() {
    return {[](const std::string& word) -> std::string { return word.empty() ? "is empty" : ""; },
            ""};
}

ListOptions readList(const CLI::App& app, const Words& words) {
    ListOptions list{.headings = !words.noHeadings};
    if (app.count("kind") > 0) {
        list.kind = kindNamed(words.kind);
    }
    if (app.count("--columns") > 0) {
        list.columns = parseColumns(words.columns);
    }
    for (const std::string& filter : words.filters) {
        list.filters.push_back(parseFilter(filter));
    }
    if (list.columns && list.kind == nullptr && !list.columns->all) {
        throw Failure{ExitStatus::usage, "columns can be chosen for one KIND only"};
    }
    return list;
}

// In the order of CommandOptions.
constexpr auto subcommands = std::to_array<Subcommand>({
    {"list", "Show the lists of the inventory as tables",
     "Examples:\n"
     "  raidinfo list\n"
     "  raidinfo list disk_drives --filter 'state!=online' -o +firmware_level\n"
     "  raidinfo list logical_drives -o logical_drive_id,overall_status --noheadings\n"
     "  raidinfo list --json | jq '.data.disk_drives[].serial_number'",
     [](CLI::App& app, Words& words) {
         app.add_option("kind", words.kind, "One list only, with its chief columns")
             ->type_name(value_type::kind);
         app.add_option("-o,--columns", words.columns,
                        "These columns (KEY,KEY), the chief ones and these (+KEY,KEY), or all")
             ->type_name(value_type::columns)
             ->take_last();
         app.add_option("--filter", words.filters,
                        "Only records with this, such as state!=online or size>1000; the operators "
                        "are = != < <= > >= and ~ (contains); may be repeated")
             ->type_name(value_type::filter)
             ->expected(1)
             ->take_all();
         app.add_flag("--noheadings", words.noHeadings, "Print no titles");
     },
     [](const CLI::App& app, const Words& words) -> CommandOptions {
         return readList(app, words);
     }},
    {"show", "Show every field of one record", "Example: raidinfo show disk_drives 3",
     [](CLI::App& app, Words& words) {
         app.add_option("kind", words.kind, "The list")->type_name(value_type::kind)->required();
         app.add_option("position", words.position, "The record's place in its list, from 0")
             ->type_name("POSITION")
             ->check(between(0, largest))
             ->required();
     },
     [](const CLI::App&, const Words& words) -> CommandOptions {
         return ShowOptions{kindNamed(words.kind), words.position};
     }},
    {"tree", "Show what belongs to what: adapters, channels, drives, enclosures, arrays",
     "Examples:\n"
     "  raidinfo tree\n"
     "  raidinfo tree --logical",
     [](CLI::App& app, Words& words) {
         app.add_flag("--logical", words.logical,
                      "Only arrays, with the drives below them in full");
     },
     [](const CLI::App&, const Words& words) -> CommandOptions {
         return TreeOptions{words.logical};
     }},
    {"events", "Follow the controller events until interrupted",
     "Starts with the newest event. Waits for a service that goes away, and tells of numbers that\n"
     "are missing. Ends with status 130 on Ctrl-C.\n"
     "Examples:\n"
     "  raidinfo events --since 1 --count 10\n"
     "  raidinfo events --state /var/lib/raidinfo/events --exec 'logger -t raid'\n"
     "  raidinfo events --json | jq -r .data.message_string",
     [](CLI::App& app, Words& words) {
         app.add_option("--since", words.since, "Start with the event of this number")
             ->type_name("NUMBER")
             ->check(between(0, largest))
             ->take_last();
         app.add_option("--count", words.count, "End after so many events")
             ->type_name("NUMBER")
             ->check(between(1, largest))
             ->take_last();
         app.add_option("--exec", words.command,
                        "Run this shell command for each event, the event as JSON on its input")
             ->type_name("COMMAND")
             ->check(notEmpty())
             ->take_last();
         app.add_option(
                "--state", words.state,
                "Keep the last number in this file, and go on from there when started again")
             ->type_name(value_type::file)
             ->check(notEmpty())
             ->take_last();
     },
     [](const CLI::App& app, const Words& words) -> CommandOptions {
         return EventsOptions{optionalNumber(app, "--since", words.since),
                              optionalNumber(app, "--count", words.count), words.command,
                              optionalPath(words.state)};
     },
     false},
    {"watch", "Show the tree again whenever something happens",
     "What changed is marked with \"*\". Ctrl-C ends it.\n"
     "Example: raidinfo watch --interval 10",
     [](CLI::App& app, Words& words) {
         app.add_option("--interval", words.interval, "Look so often even if nothing happens")
             ->type_name("SECONDS")
             ->check(between(1, longestSeconds))
             ->default_val(WatchOptions{}.interval.count())
             ->take_last();
     },
     [](const CLI::App&, const Words& words) -> CommandOptions {
         return WatchOptions{std::chrono::seconds{words.interval}};
     },
     false},
    {"health", "Say in one word how the machine's RAID is",
     "Exit status: 0 ok, 1 warning, 2 critical, 3 unknown.\n"
     "Examples:\n"
     "  raidinfo health --explain\n"
     "  raidinfo health --nagios",
     [](CLI::App& app, Words& words) {
         app.add_flag("--explain", words.explain,
                      "Name the rule, the record, the field and its value for each finding");
         app.add_flag("--nagios", words.nagios, "Print the one line of a monitoring plugin");
         app.add_option("--policy", words.policy, "Change the rules by this file")
             ->type_name(value_type::file)
             ->check(notEmpty())
             ->take_last();
     },
     [](const CLI::App&, const Words& words) -> CommandOptions {
         if (words.nagios && (words.explain || words.json)) {
             throw Failure{ExitStatus::usage, "--nagios goes neither with --explain nor --json"};
         }
         return HealthOptions{words.explain, words.nagios, limitOf(words),
                              optionalPath(words.policy)};
     },
     false},
    {"snapshot", "Save the inventory to compare it later", "Example: raidinfo snapshot before.json",
     [](CLI::App& app, Words& words) {
         app.add_option("file", words.file, "The file to write; - prints it")
             ->type_name(value_type::file)
             ->check(notEmpty())
             ->required();
     },
     [](const CLI::App&, const Words& words) -> CommandOptions {
         return SnapshotOptions{words.file};
     }},
    {"diff", "Tell what changed in meaning between two snapshots",
     "A snapshot is a file of \"raidinfo snapshot\" or of \"raidinfo record\"; without the "
     "second,\n"
     "the inventory as it is now.\n"
     "Exit status: 0 the same, 1 different, 2 trouble.\n"
     "Examples:\n"
     "  raidinfo diff before.json\n"
     "  raidinfo diff before.json after.json --json",
     [](CLI::App& app, Words& words) {
         app.add_option("before", words.before, "The earlier snapshot")
             ->type_name(value_type::file)
             ->check(notEmpty())
             ->required();
         app.add_option("after", words.after, "The later one")
             ->type_name(value_type::file)
             ->check(notEmpty());
     },
     [](const CLI::App&, const Words& words) -> CommandOptions {
         return DiffOptions{words.before, words.after};
     }},
    {"record", "Save the service's answers until interrupted",
     "raidinfo --from FILE reads a recording, raidsim --replay FILE serves it.\n"
     "Examples:\n"
     "  raidinfo record trouble.rec\n"
     "  raidinfo record --redact --for 3600 for-support.rec",
     [](CLI::App& app, Words& words) {
         app.add_option("file", words.file, "The file to write; - prints it")
             ->type_name(value_type::file)
             ->check(notEmpty())
             ->required();
         app.add_flag("--redact", words.redact,
                      "Replace serial numbers, addresses and names, each always by the same");
         app.add_option("--for", words.duration, "End after so long; 0 saves what there is now")
             ->type_name("SECONDS")
             ->check(between(0, largest))
             ->take_last();
     },
     [](const CLI::App& app, const Words& words) -> CommandOptions {
         RecordOptions record{words.file, words.redact};
         if (const auto seconds = optionalNumber(app, "--for", words.duration)) {
             record.duration = std::chrono::seconds{*seconds};
         }
         return record;
     },
     false},
    {"doctor", "Say what is wrong when nothing shows", "Example: raidinfo doctor",
     [](CLI::App&, Words&) {},
     [](const CLI::App&, const Words& words) -> CommandOptions {
         return DoctorOptions{limitOf(words)};
     },
     false},
    {"completion", "Print the completion for bash",
     "Example: raidinfo completion > /etc/bash_completion.d/raidinfo", [](CLI::App&, Words&) {},
     [](const CLI::App&, const Words&) -> CommandOptions { return CompletionOptions{}; }},
    {"schema", "Print the JSON schema of what --json prints",
     "Example: raidinfo schema > raidinfo.schema.json", [](CLI::App&, Words&) {},
     [](const CLI::App&, const Words&) -> CommandOptions { return SchemaOptions{}; }},
});

static_assert(subcommands.size() == std::variant_size_v<CommandOptions>);

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

template <typename Rows, typename NameOf>
std::string commaSeparated(const Rows& rows, const NameOf& nameOf) {
    std::string names;
    for (const auto& row : rows) {
        names += (names.empty() ? "" : ", ") + std::string{nameOf(row)};
    }
    return names;
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
    parser->add_option("--from", words.recording, "Read this recording instead of the service")
        ->type_name(value_type::file)
        ->check(notEmpty())
        ->take_last();
    parser->add_option("--codes", words.codes, "Take the meanings of codes from this file")
        ->type_name(value_type::file)
        ->check(notEmpty())
        ->take_last();
    parser->add_option("--library", words.library, "Load this library file")
        ->type_name(value_type::file)
        ->check(notEmpty())
        ->take_last();
    parser
        ->add_option("--timeout", words.timeout,
                     "Give up when the service has not answered after so long; 0 waits for ever")
        ->type_name("SECONDS")
        ->check(between(0, longestSeconds))
        ->default_val(defaultLimitSeconds)
        ->take_last();
    for (const Subcommand& subcommand : subcommands) {
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
    for (const Subcommand& subcommand : subcommands) {
        const CLI::App* const app = parser->get_subcommand(subcommand.name);
        if (app->parsed()) {
            options.command = subcommand.read(*app, words);
            options.limit = subcommand.limited ? limitOf(words) : std::nullopt;
        }
    }
    return options;
}

std::string subcommandNames() {
    return commaSeparated(subcommands, [](const Subcommand& row) { return row.name; });
}

std::string kindNames() {
    return commaSeparated(inventoryKinds(), [](const Kind& kind) { return kind.key; });
}

std::vector<std::string> colorChoices() {
    std::vector<std::string> names;
    for (const auto& [name, choice] : colors) {
        names.emplace_back(name);
    }
    return names;
}

}  // namespace raidinfo
