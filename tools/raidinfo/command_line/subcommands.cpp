#include "command_line/subcommands.h"

#include <array>
#include <limits>
#include <utility>

#include "exit_status.h"
#include "text/enumerated.h"

namespace raidinfo {
namespace {

constexpr int largest = std::numeric_limits<int>::max();

const Kind* kindNamed(const std::string& key) {
    const Kind* const kind = findInventoryKind(key);
    if (kind == nullptr) {
        throw Failure{ExitStatus::usage,
                      "\"" + key + "\" is no kind of record; there are " + kindNames()};
    }
    return kind;
}

std::optional<int> optionalNumber(const CLI::App& app, const char* option, int value) {
    return app.count(option) == 0 ? std::nullopt : std::optional{value};
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
         app.add_flag("--noheadings", words.noHeadings,
                      "Print no titles; without KIND, begin each row with its kind");
     },
     [](const CLI::App& app, const Words& words) -> CommandOptions {
         return readList(app, words);
     }},
    {"show", "Show every field of one record", "Example: raidinfo show disk_drives 3",
     [](CLI::App& app, Words& words) {
         app.add_option("kind", words.kind, "The list")->type_name(value_type::kind)->required();
         app.add_option("position", words.position, "The record's place in its list, from 0")
             ->type_name("POSITION")
             ->transform(between({0, largest}))
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
         addNumber(app, "--since", words.since, "Start with the event of this number", "NUMBER",
                   {0, largest});
         addNumber(app, "--count", words.count, "End after so many events", "NUMBER", {1, largest});
         app.add_option("--exec", words.command,
                        "Run this shell command for each event, the event as JSON on its input")
             ->type_name("COMMAND")
             ->check(notEmpty())
             ->take_last();
         addFile(app, "--state", words.state,
                 "Keep the last number in this file, and go on from there when started again, "
                 "whatever --since says");
         addNumber(app, "--interval", words.eventsInterval,
                   "Look so often whether the service counts anew, even if nothing comes",
                   "SECONDS", {1, longestSeconds})
             ->default_val(EventsOptions{}.interval.count());
     },
     [](const CLI::App& app, const Words& words) -> CommandOptions {
         return EventsOptions{optionalNumber(app, "--since", words.since),
                              optionalNumber(app, "--count", words.count), words.command,
                              optionalPath(words.state),
                              std::chrono::seconds{words.eventsInterval}};
     }},
    {"watch", "Show the tree again whenever something happens",
     "What changed is marked with \"*\". Ctrl-C ends it.\n"
     "Example: raidinfo watch --interval 10",
     [](CLI::App& app, Words& words) {
         addNumber(app, "--interval", words.interval, "Look so often even if nothing happens",
                   "SECONDS", {1, longestSeconds})
             ->default_val(WatchOptions{}.interval.count());
     },
     [](const CLI::App&, const Words& words) -> CommandOptions {
         return WatchOptions{std::chrono::seconds{words.interval}};
     },
     "a recording does not change; watch needs the service"},
    {"health", "Say in one word how the machine's RAID is",
     "Exit status: 0 ok, 1 warning, 2 critical, 3 unknown.\n"
     "Examples:\n"
     "  raidinfo health --explain\n"
     "  raidinfo health --nagios",
     [](CLI::App& app, Words& words) {
         app.add_flag("--explain", words.explain,
                      "Name the rule, the record, the field and its value for each finding");
         app.add_flag("--nagios", words.nagios, "Print the one line of a monitoring plugin");
         addFile(app, "--policy", words.policy, "Change the rules by this file");
     },
     [](const CLI::App&, const Words& words) -> CommandOptions {
         if (words.nagios && (words.explain || words.json)) {
             throw Failure{ExitStatus::usage, "--nagios goes neither with --explain nor --json"};
         }
         return HealthOptions{words.explain, words.nagios, optionalPath(words.policy)};
     }},
    {"snapshot", "Save the inventory to compare it later", "Example: raidinfo snapshot before.json",
     [](CLI::App& app, Words& words) {
         addFileOperand(app, "file", words.file, "The file to write; - prints it")->required();
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
         addFileOperand(app, "before", words.before, "The earlier snapshot")->required();
         addFileOperand(app, "after", words.after, "The later one");
     },
     [](const CLI::App&, const Words& words) -> CommandOptions {
         if (!words.after.empty() && !words.recording.empty()) {
             throw Failure{ExitStatus::usage, "--from takes the place of AFTER"};
         }
         return DiffOptions{words.before, words.after};
     }},
    {"record", "Save the service's answers until interrupted",
     "raidinfo --from FILE reads a recording, raidsim --replay FILE serves it.\n"
     "Examples:\n"
     "  raidinfo record trouble.rec\n"
     "  raidinfo record --redact --for 3600 for-support.rec",
     [](CLI::App& app, Words& words) {
         addFileOperand(app, "file", words.file, "The file to write; - prints it")->required();
         app.add_flag("--redact", words.redact,
                      "Replace serial numbers, addresses and names, each always by the same");
         addNumber(app, "--for", words.duration, "End after so long; 0 saves what there is now",
                   "SECONDS", {0, largest});
     },
     [](const CLI::App& app, const Words& words) -> CommandOptions {
         RecordOptions record{words.file, words.redact};
         if (const auto seconds = optionalNumber(app, "--for", words.duration)) {
             record.duration = std::chrono::seconds{*seconds};
         }
         return record;
     },
     "record saves what the service answers, not a recording"},
    {"doctor", "Say what is wrong when nothing shows", "Example: raidinfo doctor",
     [](CLI::App&, Words&) {},
     [](const CLI::App&, const Words&) -> CommandOptions { return DoctorOptions{}; },
     "doctor examines the service, not a recording"},
    {"completion", "Print the completion for bash",
     "Example: raidinfo completion > /etc/bash_completion.d/raidinfo", [](CLI::App&, Words&) {},
     [](const CLI::App&, const Words&) -> CommandOptions { return CompletionOptions{}; }},
    {"schema", "Print the JSON schema of what --json prints",
     "Example: raidinfo schema > raidinfo.schema.json", [](CLI::App&, Words&) {},
     [](const CLI::App&, const Words&) -> CommandOptions { return SchemaOptions{}; }},
});

static_assert(subcommands.size() == std::variant_size_v<CommandOptions>);

}  // namespace

std::span<const Subcommand> allSubcommands() noexcept { return subcommands; }

std::string subcommandNames() { return enumerated(subcommands, &Subcommand::name); }

std::string kindNames() { return enumerated(inventoryKinds(), &Kind::key); }

}  // namespace raidinfo
