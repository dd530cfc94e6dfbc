#include "application.h"

#include <unistd.h>

#include <algorithm>
#include <exception>
#include <string>
#include <variant>

#include "cancellable.h"
#include "event_line.h"
#include "exit_status.h"
#include "json.h"
#include "library.h"
#include "options.h"
#include "output.h"
#include "service.h"
#include "structure.h"
#include "table.h"
#include "tree.h"

namespace raidinfo {
namespace {

std::string inventoryText(const Options& options, const Inventory& inventory) {
    if (options.command == Command::list) {
        return options.json ? inventoryJson(inventory.snapshot) : tables(inventory.snapshot);
    }
    const Group trees = adapterTrees(inventory.adapters, inventory.snapshot);
    return options.json ? treeJson(trees) : drawn(trees);
}

void showEvents(const Library& library, bool json, const Output& output,
                const std::stop_token& stop) {
    const auto show = [json, &output](const Records& events) {
        std::string lines;
        for (const Record& event : events) {
            lines += json ? eventJson(event) : eventLine(event);
        }
        output.write(lines);
    };
    followEvents(library, show, stop);
}

Ending runCommand(const Options& options, const Output& output) {
    CancellableRun cancellable;
    const Library library{options.library};
    const auto work = [&options, &library, &output](const std::stop_token& stop) {
        if (options.command == Command::events) {
            showEvents(library, options.json, output, stop);
            return;
        }
        const Inventory inventory = readInventory(library, stop);
        output.write(inventoryText(options, inventory));
    };
    return cancellable.run(work, library.function<void()>("cancelGetEvent"), options.limit);
}

int exitStatus(const Ending& ending) {
    if (ending.timedOut) {
        throw Failure{ExitStatus::serviceUnavailable,
                      "the RAID management service gave no answer within the --timeout"};
    }
    return ending.signal ? signalExitBase + *ending.signal : static_cast<int>(ExitStatus::ok);
}

/// One line on standard error, whatever the message holds.
int report(ExitStatus status, std::string message) {
    std::ranges::replace(message, '\n', ' ');
    message = "raidinfo: " + message + "\n";
    // Nothing can be done when this fails too.
    [[maybe_unused]] const ssize_t written = write(STDERR_FILENO, message.data(), message.size());
    return static_cast<int>(status);
}

}  // namespace

int runProgram(int argc, const char* const* argv) {
    try {
        const auto parsed = parseOptions(argc, argv);
        const Output output;
        if (const auto* const information = std::get_if<Information>(&parsed)) {
            output.write(information->text);
            return static_cast<int>(ExitStatus::ok);
        }
        return exitStatus(runCommand(std::get<Options>(parsed), output));
    } catch (const Failure& failure) {
        return report(failure.status(), failure.what());
    } catch (const std::exception& error) {
        return report(ExitStatus::internalError, error.what());
    }
}

}  // namespace raidinfo
