#pragma once

#include <boost/asio/io_context.hpp>
#include <boost/asio/signal_set.hpp>
#include <boost/asio/steady_timer.hpp>
#include <iosfwd>
#include <optional>
#include <stdexcept>
#include <string>
#include <string_view>

#include "control/scenario.h"
#include "net/line_reader.h"
#include "net/server.h"
#include "options.h"
#include "service.h"

namespace raidsim {

enum class ExitStatus {
    ok = 0,
    usage = 64,
    badInput = 65,
    noInput = 66,
    cannotListen = 69,
    internal = 70,
    cannotWrite = 74
};

// Why the program could not start.
class StartError : public std::runtime_error {
public:
    StartError(ExitStatus why, const std::string& message)
        : std::runtime_error(message), exitStatus(why) {}
    [[nodiscard]] ExitStatus status() const noexcept { return exitStatus; }

private:
    ExitStatus exitStatus;
};

// The whole program: reads its files, listens, obeys signals, standard input and the scenario.
class Simulator {
public:
    // Throws StartError.
    Simulator(const Options& options, std::ostream& replies, std::ostream& complaints);

    // Serves until told to quit.
    void run();

private:
    void runInit(const std::string& path);
    void armFault(const std::string& path);
    void listen(std::uint16_t port);
    void obeySignals();
    void obey(const Command& command, const std::string& origin);
    void obeyLine(std::optional<std::string_view> line);
    void playScenario();
    void complain(const std::string& message);
    void quit();

    std::ostream& out;
    std::ostream& err;
    boost::asio::io_context context{1};
    Service service;
    ScenarioPlayer scenario;
    std::string scenarioPath;
    double speed;
    bool quitting = false;
    boost::asio::steady_timer scenarioTimer;
    std::chrono::steady_clock::time_point scenarioStart;
    boost::asio::signal_set signals;
    std::optional<Server> server;
    std::optional<LineReader> input;
};

}  // namespace raidsim
