#include "options.h"

#include <CLI/CLI.hpp>

namespace raidsim {

namespace {

// Sizes of a rack that the service's numbers still tell apart.
const CLI::Range rackNumber(0, 100'000);

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

}  // namespace

Wanted parseOptions(int argc, const char* const* argv) {
    Options options;
    generate::Order order;
    CLI::App app("Simulates the RAID management service on 127.0.0.1.", "raidsim");
    app.add_option("CONFIG", options.config, "Configuration document to serve");
    app.add_option("--init", options.init, "File of control commands to run before listening");
    app.add_option("--scenario", options.scenario, "File of timed control commands to play");
    app.add_option("--fault", options.fault, "Fault file whose cases the clients meet in turn");
    app.add_option("--speed", options.speed, "How much faster the scenario's time passes")
        ->check(CLI::Range(0.001, 1e6))
        ->capture_default_str();
    app.add_option("--port", options.port, "Port to listen on; 0 picks a free one")
        ->capture_default_str();
    app.footer("The service is controlled by lines on standard input; \"help\" lists them.");
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
    if (options.config.empty())
        throw UsageError("CONFIG is required");
    return options;
}

}  // namespace raidsim
