#include <algorithm>
#include <csignal>
#include <exception>
#include <iostream>
#include <string>

#include "options.h"
#include "process/standard_descriptors.h"
#include "simulator.h"

namespace {

// A file that is no text may be one word of megabytes, which the message names.
std::string shortened(std::string message) {
    constexpr std::size_t end = 500;
    if (message.size() > 2 * end)
        message.replace(end, message.size() - 2 * end, "...");
    return message;
}

// On one line, whatever the command line holds.
int leave(raidsim::ExitStatus status, const std::string& complaint) {
    std::string message = shortened(complaint);
    std::ranges::replace_if(
        message, [](char c) { return c >= '\0' && c < ' '; }, '?');
    std::cerr << "raidsim: " << message << std::endl;
    return static_cast<int>(status);
}

int print(const std::string& text) {
    std::cout << text << std::flush;
    return std::cout ? static_cast<int>(raidsim::ExitStatus::ok)
                     : leave(raidsim::ExitStatus::cannotWrite, "cannot write the output");
}

}  // namespace

int main(int argc, char** argv) {
    process::fillStandardDescriptors();
    // A reader of the output that goes away, or a terminal that belongs to another process, is
    // no reason to stop.
    std::signal(SIGPIPE, SIG_IGN);
    std::signal(SIGTTIN, SIG_IGN);
    std::signal(SIGTTOU, SIG_IGN);
    try {
        const auto wanted = raidsim::parseOptions(argc, argv);
        if (const auto* const information = std::get_if<raidsim::Information>(&wanted))
            return print(information->text);
        if (const auto* const order = std::get_if<raidsim::generate::Order>(&wanted))
            return print(raidsim::generate::generate(*order));
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
