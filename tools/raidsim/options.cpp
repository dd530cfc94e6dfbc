#include "options.h"

#include <CLI/CLI.hpp>

#include "text.h"

namespace raidsim {

namespace {

// Sizes of a rack that the service's numbers still tell apart.
const CLI::Range rackNumber(0, 100'000);

constexpr const char* description =
    "Simulates the RAID management service on 127.0.0.1: serves the configuration CONFIG, or what "
    "was\n"
    "recorded of another service, and obeys lines on its standard input (\"help\" lists them).";

constexpr const char* footer =
    "Examples:\n"
    "  raidsim examples/small-server.xml\n"
    "      serves a document until Ctrl-C\n"
    "  raidsim --scenario examples/scenarios/disk-failure.scenario --speed 10\n"
    "      plays a scenario, which names its configuration, in a tenth of its time\n"
    "  raidsim --scenario examples/scenarios/disk-failure.scenario --clock virtual\n"
    "      stands still until it is told \"advance SECONDS\"\n"
    "  raidsim --init examples/small-server.init --fault faults/connection/reset-in-body.fault \\\n"
    "          examples/small-server.xml\n"
    "      has some events, and resets the first connection\n"
    "  raidsim --replay monday.rec --speed 60\n"
    "      answers as the recorded service did, an hour in a minute\n"
    "  raidsim generate --adapters 4 --channels 2 --drives 24 >rack.xml\n"
    "      writes a document of any size\n"
    "\n"
    "Exit status: 0 told to quit, 64 wrong command line, 65 a file is malformed, 66 a file cannot "
    "be\n"
    "read, 69 cannot listen, 70 internal error, 74 cannot write.";

CLI::App* addGenerate(CLI::App& app, generate::Order& order) {
    auto* const command = app.add_subcommand(
        "generate", "Write a document of any size to standard output; it is the same every time.");
    command->add_option("--adapters", order.rack.adapters, "Adapters")
        ->check(rackNumber)
        ->capture_default_str();
    command->add_option("--channels", order.rack.channels, "Channels of each adapter")
        ->check(rackNumber)
        ->capture_default_str();
    command->add_option("--drives", order.rack.drives, "Drives of each channel")
        ->check(rackNumber)
        ->capture_default_str();
    command->add_option("--events", order.events, "Write an events answer with so many instead")
        ->check(rackNumber);
    command->add_option("--shuffle", order.shuffle,
                        "Shuffle the children of each element, with this seed");
    command->add_flag_callback(
        "--compact", [&order] { order.layout = xml::Layout::compact; },
        "Without line feeds and indentation");
    return command;
}

// What is served, and what happens to it.
void addContent(CLI::App& app, Options& options) {
    auto* const config = app.add_option(
        "CONFIG", options.config, "Configuration document to serve, unless the scenario names one");
    app.add_option("--replay", options.replay, "Recording to serve in place of a configuration")
        ->excludes(config);
    app.add_option("--init", options.init, "File of control commands to run before listening");
    app.add_option("--scenario", options.scenario, "File of timed control commands to play");
    app.add_option("--fault", options.fault, "Fault file whose cases the clients meet in turn");
}

// An option whose text is read by parse, which gives nothing for one that is wrong.
template <typename Value>
void addParsed(CLI::App& app, const std::string& name, const char* meaning,
               std::optional<Value>& target, std::optional<Value> (*parse)(std::string_view),
               const char* wrong) {
    app.add_option_function<std::string>(
        name,
        [=, &target](const std::string& text) {
            target = parse(text);
            if (!target)
                throw CLI::ValidationError(name, text + " is " + wrong);
        },
        meaning);
}

void addTime(CLI::App& app, Options& options) {
    app.add_option_function<std::string>(
           "--clock",
           [&options](const std::string& name) {
               options.clock = name == "real" ? ClockKind::real : ClockKind::virtualTime;
           },
           "What moves the time of scenario and recording: \"real\" (the default), or \"virtual\": "
           "only the command \"advance\"")
        ->check(CLI::IsMember({"real", "virtual"}));
    addParsed(app, "--epoch", "Date (UTC) at which the virtual clock begins", options.epoch,
              parseUtc, "no time such as 2026-11-21T17:48:00Z");
    app.add_option("--speed", options.speed, "How much faster the real clock's time passes")
        ->check(CLI::Range(0.001, 1e6))
        ->capture_default_str();
    addParsed(app, "--seed", "Seed of the scenario's choices in place of its own", options.seed,
              parseCount, "no number from 0 to 18446744073709551615");
}

void checkTogether(const CLI::App& app, const Options& options) {
    if (options.config.empty() && options.scenario.empty() && options.replay.empty())
        throw UsageError("CONFIG is required");
    const bool real = options.clock == ClockKind::real;
    if (real && options.epoch)
        throw UsageError("--epoch needs --clock virtual");
    if (!real && app.count("--speed") > 0)
        throw UsageError("--speed needs --clock real");
}

}  // namespace

Wanted parseOptions(int argc, const char* const* argv) {
    Options options;
    generate::Order order;
    CLI::App app(description, "raidsim");
    addContent(app, options);
    addTime(app, options);
    app.add_option("--port", options.port, "Port to listen on; 0 picks a free one")
        ->capture_default_str();
    app.footer(footer);
    const auto* const generating = addGenerate(app, order);
    try {
        app.parse(argc, argv);
    } catch (const CLI::CallForHelp&) {
        return HelpWanted{app.help()};
    } catch (const CLI::ParseError& error) {
        throw UsageError(error.what());
    }
    if (generating->parsed())
        return order;
    checkTogether(app, options);
    return options;
}

}  // namespace raidsim
