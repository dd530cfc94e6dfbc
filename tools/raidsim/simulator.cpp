#include "simulator.h"

#include <unistd.h>

#include <boost/system/system_error.hpp>
#include <csignal>
#include <ostream>

#include "files.h"

namespace raidsim {

namespace {

// Reads a file in two steps that fail with different exit statuses.
template <typename Parse>
auto load(const std::string& path, Parse parse) {
    std::string text;
    try {
        text = readFile(path);
    } catch (const FileError& error) {
        throw StartError(ExitStatus::noInput, path + ": " + error.what());
    }
    try {
        return parse(text);
    } catch (const std::runtime_error& error) {
        throw StartError(ExitStatus::badInput, path + ": " + error.what());
    }
}

std::vector<ScenarioStep> loadScenario(const std::string& path) {
    return path.empty() ? std::vector<ScenarioStep>() : load(path, parseScenario);
}

}  // namespace

Simulator::Simulator(const Options& options, std::ostream& replies, std::ostream& complaints)
    : out(replies),
      err(complaints),
      service(load(options.config, Document::parse), options.config),
      scenario(loadScenario(options.scenario)),
      scenarioPath(options.scenario),
      speed(options.speed),
      scenarioTimer(context),
      signals(context, SIGINT, SIGTERM, SIGHUP) {
    service.faults().tell = [this](const std::string& line) { out << line << std::endl; };
    runInit(options.init);
    armFault(options.fault);
    listen(options.port);
    out << "raidsim: listening on 127.0.0.1:" << server->port() << std::endl;
}

void Simulator::run() {
    if (quitting)
        return;
    obeySignals();
    input.emplace(context, STDIN_FILENO,
                  [this](std::optional<std::string_view> line) { obeyLine(line); });
    scenarioStart = std::chrono::steady_clock::now();
    playScenario();
    context.run();
}

void Simulator::runInit(const std::string& path) {
    if (path.empty())
        return;
    for (const ScriptLine& line : load(path, parseScript)) {
        try {
            quitting = line.command(service).quit || quitting;
        } catch (const CommandError& error) {
            throw StartError(ExitStatus::badInput,
                             path + ": line " + std::to_string(line.number) + ": " + error.what());
        }
    }
}

void Simulator::armFault(const std::string& path) {
    if (path.empty())
        return;
    try {
        service.faults().arm(std::make_shared<const FaultFile>(path), std::nullopt);
    } catch (const FileError& error) {
        throw StartError(ExitStatus::noInput, path + ": " + error.what());
    } catch (const FaultError& error) {
        throw StartError(ExitStatus::badInput, path + ": " + error.what());
    }
}

void Simulator::listen(std::uint16_t port) {
    ServerSettings settings;
    settings.port = port;
    try {
        server.emplace(context, service, settings);
    } catch (const boost::system::system_error& error) {
        throw StartError(
            ExitStatus::cannotListen,
            "cannot listen on 127.0.0.1:" + std::to_string(port) + ": " + error.code().message());
    }
}

void Simulator::obeySignals() {
    signals.async_wait([this](boost::system::error_code error, int number) {
        if (error)
            return;
        if (number != SIGHUP) {
            quit();
            return;
        }
        obey(parseCommand("reload"), {});
        obeySignals();
    });
}

void Simulator::obey(const Command& command, const std::string& origin) {
    try {
        const Outcome outcome = command(service);
        if (!outcome.message.empty())
            out << outcome.message << std::endl;
        if (outcome.quit)
            quit();
    } catch (const CommandError& error) {
        complain(origin + error.what());
    }
}

void Simulator::obeyLine(std::optional<std::string_view> line) {
    try {
        if (!line)
            throw CommandError("the line is too long");
        obey(parseCommand(*line), {});
    } catch (const CommandError& error) {
        complain(error.what());
    }
}

void Simulator::playScenario() {
    const auto due = scenario.nextDue();
    if (!due || quitting)
        return;
    const auto scaled = std::chrono::duration<double, std::milli>(*due) / speed;
    scenarioTimer.expires_at(scenarioStart +
                             std::chrono::round<std::chrono::steady_clock::duration>(scaled));
    scenarioTimer.async_wait([this, due = *due](boost::system::error_code cancelled) {
        if (cancelled)
            return;
        scenario.advanceTo(due, [this](const ScriptLine& line) {
            obey(line.command, scenarioPath + ": line " + std::to_string(line.number) + ": ");
        });
        playScenario();
    });
}

void Simulator::complain(const std::string& message) { err << "raidsim: " << message << std::endl; }

void Simulator::quit() {
    quitting = true;
    server->stop();
    input->stop();
    signals.cancel();
    scenarioTimer.cancel();
}

}  // namespace raidsim
