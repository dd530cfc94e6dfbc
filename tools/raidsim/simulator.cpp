#include "simulator.h"

#include <unistd.h>

#include <boost/system/system_error.hpp>
#include <csignal>
#include <memory>
#include <ostream>
#include <utility>

#include "files.h"
#include "text.h"

namespace raidsim {

Simulator::Simulator(const Options& options, std::ostream& replies, std::ostream& complaints)
    : Simulator(options, startUp(options), replies, complaints) {}

Simulator::Simulator(const Options& options, Startup startup, std::ostream& replies,
                     std::ostream& complaints)
    : out(replies),
      err(complaints),
      player(std::move(startup.steps)),
      scenarioPath(options.scenario),
      clock(options.clock),
      epoch(startup.epoch),
      speed(options.speed),
      service(std::move(startup.document), std::move(startup.documentPath),
              [this] { return date(); }),
      scenarioTimer(context),
      signals(context, SIGINT, SIGTERM, SIGHUP) {
    service.faults().tell = [this](const std::string& line) { out << line << std::endl; };
    service.faults().complain = [this](const std::string& line) { complain(line); };
    if (!startup.warning.empty())
        complain(startup.warning);
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
    // Before any client is accepted.
    playTo(std::chrono::milliseconds(0));
    awaitStep();
    context.run();
}

void Simulator::runInit(const std::string& path) {
    if (path.empty())
        return;
    const auto script = loading(path, FileKind::commands,
                                [&] { return parseScript(readFile(path), folderOf(path)); });
    for (const ScriptLine& line : script) {
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
    loading(path, FileKind::fault,
            [&] { service.faults().arm(std::make_shared<const FaultFile>(path), std::nullopt); });
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
        if (outcome.advance)
            advance(*outcome.advance);
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

std::chrono::sys_seconds Simulator::date() const {
    using namespace std::chrono;
    return clock == ClockKind::real ? floor<seconds>(system_clock::now())
                                    : epoch + floor<seconds>(player.elapsed());
}

void Simulator::playTo(std::chrono::milliseconds elapsed) {
    player.advanceTo(elapsed, [this](const ScriptLine& line) {
        if (!quitting)
            obey(line.command, scenarioPath + ": line " + std::to_string(line.number) + ": ");
    });
}

void Simulator::awaitStep() {
    const auto due = player.nextDue();
    if (clock != ClockKind::real || !due || quitting)
        return;
    scenarioTimer.expires_at(scenarioStart + realTime(*due, speed));
    scenarioTimer.async_wait([this, due = *due](boost::system::error_code cancelled) {
        if (cancelled)
            return;
        playTo(due);
        awaitStep();
    });
}

void Simulator::advance(std::chrono::milliseconds time) {
    if (clock == ClockKind::real)
        throw CommandError("advance: the clock is real; start with --clock virtual");
    playTo(player.elapsed() + time);
    out << "time " << formatSeconds(player.elapsed()) << std::endl;
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
