#include "options.h"

#include <CLI/CLI.hpp>
#include <algorithm>
#include <limits>
#include <string_view>
#include <vector>

#include "completion/completion.h"
#include "option_values.h"

namespace raidsim {

namespace {

// Sizes of a rack that the service's numbers still tell apart.
constexpr std::uint64_t largestRack = 100'000;

template <typename Number>
constexpr std::uint64_t most = std::numeric_limits<Number>::max();

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
    "  raidsim generate >server.xml\n"
    "      writes a document with one adapter and twelve drives\n"
    "  raidsim generate --adapters 4 --channels 2 --drives 24 >rack.xml\n"
    "      writes one of another size\n"
    "\n"
    "Exit status: 0 told to quit, 64 wrong command line, 65 a file is malformed, 66 a file cannot "
    "be\n"
    "read, 69 cannot listen, 70 internal error, 74 the output cannot be written.";

constexpr const char* generateFooter =
    "Numbers are 0 to 100000, with 50000 adapters, channels and drives in all at most.\n"
    "Examples:\n"
    "  raidsim generate >server.xml\n"
    "      one adapter with a channel of twelve drives\n"
    "  raidsim generate --adapters 4 --channels 2 --drives 24 --shuffle 7 >rack.xml\n"
    "      192 drives, all in an unusual order\n"
    "  raidsim generate --events 10000 --compact >events.xml\n"
    "      an answer with many events, on one line";

// An option or an operand whose word is read by its form.
template <typename Target, typename Value>
CLI::Option* addValue(CLI::App& app, const std::string& name, const char* meaning, Target& target,
                      const ValueForm<Value>& form) {
    return app
        .add_option_function<std::string>(
            name,
            [=, &target](const std::string& word) {
                const std::optional<Value> value = form.read(word);
                if (!value)
                    throw CLI::ValidationError(name, '"' + word + "\" is " + form.wrong);
                target = *value;
            },
            meaning)
        ->type_name(form.type);
}

// The same with the value that it has otherwise.
template <typename Number>
void addNumber(CLI::App& app, const std::string& name, const char* meaning, Number& target,
               const ValueForm<Number>& form) {
    addValue(app, name, meaning, target, form)->default_val(target);
}

void addGenerate(CLI::App& app, generate::Order& order) {
    auto& command = *app.add_subcommand(
        "generate", "Write a document of any size to standard output; it is the same every time.");
    const auto number = forms::number<int>("NUMBER", largestRack);
    addNumber(command, "--adapters", "Adapters", order.rack.adapters, number);
    addNumber(command, "--channels", "Channels of each adapter", order.rack.channels, number);
    addNumber(command, "--drives", "Drives of each channel", order.rack.drives, number);
    addValue(command, "--events", "Write an events answer with so many instead", order.events,
             number);
    addValue(command, "--shuffle", "Shuffle the children of each element, with this seed",
             order.shuffle, forms::number<std::uint32_t>("SEED", most<std::uint32_t>));
    command.add_flag_callback(
        "--compact", [&order] { order.layout = xml::Layout::compact; },
        "Without line feeds and indentation");
    command.footer(generateFooter);
}

// What is served, and what happens to it.
void addContent(CLI::App& app, Options& options) {
    const auto file = forms::file();
    addValue(app, "CONFIG", "Configuration document to serve, unless the scenario names one",
             options.config, file);
    addValue(app, "--replay", "Recording to serve in place of a configuration", options.replay,
             file);
    addValue(app, "--init", "File of control commands to run before listening", options.init, file);
    addValue(app, "--scenario", "File of timed control commands to play", options.scenario, file);
    addValue(app, "--fault", "Fault file whose cases the clients meet in turn", options.fault,
             file);
}

void addTime(CLI::App& app, Options& options) {
    addValue(
        app, "--clock",
        "What moves the time of scenario and recording: \"real\" (the default), or \"virtual\": "
        "only the command \"advance\"",
        options.clock, forms::clock());
    addValue(app, "--epoch", "Date (UTC) at which the virtual clock begins", options.epoch,
             forms::date());
    addNumber(app, "--speed",
              "How much faster the real clock moves scenario and recording, 0.001 to 1000000",
              options.speed, forms::factor());
    addValue(app, "--seed", "Seed of the scenario's choices in place of its own", options.seed,
             forms::number<std::uint64_t>("NUMBER", most<std::uint64_t>));
}

std::string completionOf(const CLI::App& app) {
    return completion::forBash(
        app, {{forms::file().type, completion::Form::file},
              {forms::clock().type, completion::Form::word, forms::clockNames()}});
}

// What is wrong with the command line, where CLI11's words for it are not for everybody.
std::string unexpectedWord(const CLI::App& app) {
    // A word of two hyphens only ends the options.
    const std::vector<std::string> words = app.remaining(true);
    const auto found = std::ranges::find_if(words, [](const auto& each) { return each != "--"; });
    const std::string& word = found == words.end() ? words.front() : *found;
    return (word.starts_with('-') ? "unknown option \"" : "one word too many, \"") + word +
           "\" (see raidsim --help)";
}

std::string wrongNumber(const CLI::ArgumentMismatch& error) {
    const std::string_view what = error.what();
    return std::string(what.substr(0, what.find(':'))) +
           (what.ends_with("missing") ? " needs a value" : " is given more than once");
}

// The subcommands have nothing to do with what is served.
void checkAlone(const CLI::App& app, const CLI::App& subcommand) {
    for (const CLI::Option* const option : app.get_options()) {
        if (option->count() > 0)
            throw UsageError(option->get_name() + " does not go with " + subcommand.get_name());
    }
}

// The document is made in memory, where so many take up to 2.7 gigabytes of the 32-bit program.
void checkSize(const CLI::App& command, const generate::Order& order) {
    constexpr double most = 50'000;
    const generate::RackSize& rack = order.rack;
    const double channels = 1.0 * rack.adapters * rack.channels;
    if (rack.adapters + channels + channels * rack.drives > most)
        throw UsageError("a rack has 50000 adapters, channels and drives at most");
    for (const char* const size : {"--adapters", "--channels", "--drives"}) {
        if (order.events && command.count(size) > 0) {
            throw UsageError("--events writes no rack, so " + std::string(size) +
                             " does not go with it");
        }
    }
}

void checkTogether(const CLI::App& app, const Options& options) {
    if (!options.config.empty() && !options.replay.empty())
        throw UsageError("--replay serves a recording in place of CONFIG; both are given");
    if (options.config.empty() && options.scenario.empty() && options.replay.empty())
        throw UsageError("CONFIG is required");
    const bool real = options.clock == ClockKind::real;
    if (real && options.epoch)
        throw UsageError("--epoch needs --clock virtual");
    if (!real && app.count("--speed") > 0)
        throw UsageError("--speed needs --clock real");
    if (options.scenario.empty() && options.replay.empty() && app.count("--speed") > 0)
        throw UsageError("--speed needs --scenario or --replay");
    if (options.scenario.empty() && options.seed)
        throw UsageError("--seed needs --scenario");
}

}  // namespace

Wanted parseOptions(int argc, const char* const* argv) {
    Options options;
    generate::Order order;
    CLI::App app(description, "raidsim");
    app.set_version_flag("--version", RAIDSIM_VERSION);
    app.require_subcommand(0, 1);
    addContent(app, options);
    addTime(app, options);
    addNumber(app, "--port", "Port to listen on; 0 picks a free one", options.port,
              forms::number<std::uint16_t>("NUMBER", most<std::uint16_t>));
    app.footer(footer);
    addGenerate(app, order);
    app.add_subcommand("completion", "Print the completion for bash.")
        ->footer("Example: raidsim completion >/etc/bash_completion.d/raidsim");
    try {
        app.parse(argc, argv);
    } catch (const CLI::CallForHelp&) {
        return Information{app.help()};
    } catch (const CLI::CallForVersion& version) {
        return Information{std::string("raidsim ") + version.what() + "\n"};
    } catch (const CLI::ExtrasError&) {
        throw UsageError(unexpectedWord(app));
    } catch (const CLI::ArgumentMismatch& error) {
        throw UsageError(wrongNumber(error));
    } catch (const CLI::ParseError& error) {
        throw UsageError(error.what());
    }
    const auto subcommands = app.get_subcommands();
    if (subcommands.empty()) {
        checkTogether(app, options);
        return options;
    }
    checkAlone(app, *subcommands.front());
    if (subcommands.front()->get_name() == "generate") {
        checkSize(*subcommands.front(), order);
        return order;
    }
    return Information{completionOf(app)};
}

}  // namespace raidsim
