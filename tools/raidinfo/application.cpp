#include "application.h"

#include <malloc.h>

#include <algorithm>
#include <exception>
#include <functional>
#include <nlohmann/json.hpp>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <variant>

#include "command_line/options.h"
#include "commands/commands.h"
#include "exit_status.h"
#include "health/nagios.h"
#include "health/verdict.h"
#include "json/envelope.h"
#include "json/schema.h"
#include "library/library.h"
#include "overloaded.h"
#include "system/cancellable.h"
#include "system/output.h"

namespace raidinfo {
namespace {

/// What needs neither the library nor a service.
std::optional<std::string> plainText(const CommandOptions& command) {
    if (std::holds_alternative<CompletionOptions>(command)) {
        return bashCompletion();
    }
    if (std::holds_alternative<SchemaOptions>(command)) {
        return document(schema());
    }
    return std::nullopt;
}

/// Memory is asked for on one thread at a time, but not on the first; there it would come page by
/// page, which takes longer than to read the inventory.
void prepareMemory() {
    constexpr int atOnce = 1024 * 1024;
    mallopt(M_ARENA_MAX, 1);
    mallopt(M_TOP_PAD, atOnce);
}

int runInLibrary(const Options& options, const Output& output) {
    prepareMemory();
    CancellableRun cancellable;
    const Library library{options.library};
    int status = 0;
    const auto work = [&](const std::stop_token& stop) {
        const Session session{options, library, output, stop};
        status = std::visit(
            Overloaded{[](const CompletionOptions&) { return 0; },
                       [](const SchemaOptions&) { return 0; },
                       [&session](const auto& command) { return runCommand(session, command); }},
            options.command);
    };
    const auto signal = cancellable.run(work, library.function<void()>("cancelGetEvent"));
    return signal ? signalExitBase + *signal : status;
}

/// The failure in the form that was asked for; "" where its line is all.
std::string inForm(const Failure& failure, const Source& source, bool asJson, bool forMonitoring) {
    if (forMonitoring) {
        return health::nagiosLine(health::unknownBecause(failure.what()));
    }
    return asJson ? documentLine(enveloped(
                        source, {{troubleCode(failure.status()), failure.what()}}, nullptr))
                  : "";
}

/// Tells of a failure. That it cannot be told on the standard output, too, changes nothing.
void tell(const Failure& failure, const std::string& form, const Output& output) {
    complain(failure.what());
    try {
        output.write(form);
    } catch (const Failure&) {  // NOLINT(bugprone-empty-catch)
        // The one line on standard error says what matters.
    }
}

/// The exit status that a failure has in this subcommand.
int statusOf(const Failure& failure, const CommandOptions& command) {
    constexpr int troubleOfDiff = 2;
    return std::visit(
        Overloaded{[](const DiffOptions&) { return troubleOfDiff; },
                   [&](const HealthOptions&) {
                       return health::exitStatus(health::unknownBecause(failure.what()));
                   },
                   [&](const auto&) { return static_cast<int>(failure.status()); }},
        command);
}

int fail(const Failure& failure, const Options& options, const Output& output) {
    const auto* const health = std::get_if<HealthOptions>(&options.command);
    tell(failure,
         inForm(failure, sourceOf(options), options.json, health != nullptr && health->nagios),
         output);
    return statusOf(failure, options.command);
}

int run(const Options& options, const Output& output) {
    try {
        if (const auto text = plainText(options.command)) {
            output.write(*text);
            return static_cast<int>(ExitStatus::ok);
        }
        return runInLibrary(options, output);
    } catch (const Failure& failure) {
        return fail(failure, options, output);
    } catch (const std::exception& error) {
        return fail({ExitStatus::internalError, error.what()}, options, output);
    }
}

/// Of a command line that makes no sense, hence no Options.
int refuse(const Failure& failure, std::span<const char* const> arguments, const Output& output) {
    const auto isThere = [arguments](std::string_view word) {
        return std::ranges::any_of(arguments, [word](std::string_view argument) {
            return argument == word || (argument.starts_with(word) && argument[word.size()] == '=');
        });
    };
    const bool forMonitoring = isThere("health") && isThere("--nagios");
    tell(failure, inForm(failure, {"none", ""}, isThere("--json"), forMonitoring), output);
    // A monitoring system takes any other status for that of a plugin that is broken.
    return forMonitoring ? statusOf(failure, HealthOptions{}) : static_cast<int>(failure.status());
}

}  // namespace

int runProgram(int argc, const char* const* argv) {
    try {
        const Output output;
        std::variant<Options, Information> parsed;
        try {
            parsed = parseOptions(argc, argv);
        } catch (const Failure& failure) {
            return refuse(failure, std::span{argv, static_cast<std::size_t>(argc)}, output);
        }
        if (const auto* const information = std::get_if<Information>(&parsed)) {
            output.write(information->text);
            return static_cast<int>(ExitStatus::ok);
        }
        return run(std::get<Options>(parsed), output);
    } catch (const Failure& failure) {
        complain(failure.what());
        return static_cast<int>(failure.status());
    } catch (const std::exception& error) {
        complain(error.what());
        return static_cast<int>(ExitStatus::internalError);
    }
}

}  // namespace raidinfo
