#pragma once

#include <boost/asio/io_context.hpp>
#include <boost/asio/signal_set.hpp>
#include <boost/asio/steady_timer.hpp>
#include <chrono>
#include <iosfwd>
#include <optional>
#include <string>
#include <string_view>

#include "control/player.h"
#include "net/line_reader.h"
#include "net/server.h"
#include "options.h"
#include "service.h"
#include "start_error.h"
#include "startup.h"

namespace raidsim {

// The whole program: reads its files, listens, obeys signals, standard input and the scenario.
class Simulator {
public:
    // Throws StartError.
    Simulator(const Options& options, std::ostream& replies, std::ostream& complaints);

    // Serves until told to quit.
    void run();

private:
    Simulator(const Options& options, Startup startup, std::ostream& replies,
              std::ostream& complaints);

    void runInit(const std::string& path);
    void armFault(const std::string& path);
    void listen(std::uint16_t port);
    void obeySignals();
    void obey(const Command& command, const std::string& origin);
    void obeyLine(std::optional<std::string_view> line);
    [[nodiscard]] std::chrono::sys_seconds date() const;
    // Performs what is due until then, by the scenario's clock.
    void playTo(std::chrono::milliseconds elapsed);
    // Waits for the next step, under the real clock.
    void awaitStep();
    void advance(std::chrono::milliseconds time);
    void complain(const std::string& message);
    void quit();

    std::ostream& out;
    std::ostream& err;
    boost::asio::io_context context{1};
    ScenarioPlayer player;
    std::string scenarioPath;
    ClockKind clock;
    std::chrono::sys_seconds epoch;
    double speed;
    Service service;
    bool quitting = false;
    boost::asio::steady_timer scenarioTimer;
    std::chrono::steady_clock::time_point scenarioStart;
    boost::asio::signal_set signals;
    std::optional<Server> server;
    std::optional<LineReader> input;
};

}  // namespace raidsim
