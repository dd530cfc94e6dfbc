#include "options.h"

#include <CLI/CLI.hpp>

namespace raidsim {

std::variant<Options, HelpWanted> parseOptions(int argc, const char* const* argv) {
    Options options;
    CLI::App app("Simulates the RAID management service on 127.0.0.1.", "raidsim");
    app.add_option("CONFIG", options.config, "Configuration document to serve")->required();
    app.add_option("--init", options.init, "File of control commands to run before listening");
    app.add_option("--scenario", options.scenario, "File of timed control commands to play");
    app.add_option("--fault", options.fault, "Fault file whose cases the clients meet in turn");
    app.add_option("--speed", options.speed, "How much faster the scenario's time passes")
        ->check(CLI::Range(0.001, 1e6))
        ->capture_default_str();
    app.add_option("--port", options.port, "Port to listen on; 0 picks a free one")
        ->capture_default_str();
    app.footer("The service is controlled by lines on standard input; \"help\" lists them.");
    try {
        app.parse(argc, argv);
    } catch (const CLI::CallForHelp&) {
        return HelpWanted{app.help()};
    } catch (const CLI::ParseError& error) {
        throw UsageError(error.what());
    }
    return options;
}

}  // namespace raidsim
