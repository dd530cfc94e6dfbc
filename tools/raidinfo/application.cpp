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

/// A monitoring system takes any other status for that of a plugin that is broken.
int tellMonitoring(const Failure& failure, const Output& output) {
    const health::Verdict unknown = health::unknownBecause(failure.what());
    output.write(health::nagiosLine(unknown));
    return health::exitStatus(unknown);
}

/// Tells of a failure, and returns the exit status that it has in this subcommand.
int fail(const Failure& failure, const Options& options, const Output& output) {
    complain(failure.what());
    const bool canWrite = failure.status() != ExitStatus::outputFailed;
    if (options.json && canWrite) {
        output.write(documentLine(enveloped(
            sourceOf(options), {{troubleCode(failure.status()), failure.what()}}, nullptr)));
    }
    if (std::holds_alternative<DiffOptions>(options.command)) {
        constexpr int trouble = 2;
        return trouble;
    }
    if (const auto* const health = std::get_if<HealthOptions>(&options.command)) {
        return health->nagios && canWrite
                   ? tellMonitoring(failure, output)
                   : health::exitStatus(health::unknownBecause(failure.what()));
    }
    return static_cast<int>(failure.status());
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
    complain(failure.what());
    if (isThere("health") && isThere("--nagios")) {
        return tellMonitoring(failure, output);
    }
    if (isThere("--json")) {
        output.write(documentLine(
            enveloped({"none", ""}, {{troubleCode(failure.status()), failure.what()}}, nullptr)));
    }
    return static_cast<int>(failure.status());
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
