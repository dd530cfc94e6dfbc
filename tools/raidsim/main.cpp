#include <csignal>
#include <exception>
#include <iostream>

#include "options.h"
#include "simulator.h"

namespace {

int leave(raidsim::ExitStatus status, const char* message) {
    std::cerr << "raidsim: " << message << std::endl;
    return static_cast<int>(status);
}

}  // namespace

int main(int argc, char** argv) {
    // A reader of the output that goes away, or a terminal that belongs to another process, is
    // no reason to stop.
    std::signal(SIGPIPE, SIG_IGN);
    std::signal(SIGTTIN, SIG_IGN);
    std::signal(SIGTTOU, SIG_IGN);
    try {
        const auto wanted = raidsim::parseOptions(argc, argv);
        if (const auto* const help = std::get_if<raidsim::HelpWanted>(&wanted)) {
            std::cout << help->text;
            return static_cast<int>(raidsim::ExitStatus::ok);
        }
        if (const auto* const order = std::get_if<raidsim::generate::Order>(&wanted)) {
            std::cout << raidsim::generate::generate(*order) << std::flush;
            return static_cast<int>(std::cout ? raidsim::ExitStatus::ok
                                              : raidsim::ExitStatus::cannotWrite);
        }
        raidsim::Simulator simulator(std::get<raidsim::Options>(wanted), std::cout, std::cerr);
        simulator.run();
        return static_cast<int>(raidsim::ExitStatus::ok);
    } catch (const raidsim::UsageError& error) {
        return leave(raidsim::ExitStatus::usage, error.what());
    } catch (const raidsim::StartError& error) {
        return leave(error.status(), error.what());
    } catch (const std::exception& error) {
        return leave(raidsim::ExitStatus::internal, error.what());
    }
}
