#include "command_line/options.h"

#include <CLI/CLI.hpp>

#include "command_line/description.h"
#include "command_line/subcommands.h"
#include "exit_status.h"

namespace raidinfo {
namespace {

/// What is wrong with a command line without a subcommand, of which these words were not
/// understood.
std::string withoutSubcommand(const std::vector<std::string>& rest) {
    if (rest.empty()) {
        return "expected one of " + subcommandNames();
    }
    const std::string& word = rest.front();
    return "\"" + word + "\" is no " +
           (word.starts_with('-') ? "option, and a subcommand is missing"
                                  : "subcommand; there are " + subcommandNames());
}

}  // namespace

std::variant<Options, Information> parseOptions(int argc, const char* const* argv) {
    constexpr auto hint = " (see raidinfo --help)";
    Description description;
    try {
        description.parse(argc, argv);
        return description.options();
    } catch (const CLI::CallForHelp&) {
        return Information{description.app().help()};
    } catch (const CLI::CallForVersion& version) {
        return Information{std::string{"raidinfo "} + version.what() + "\n"};
    } catch (const CLI::RequiredError& error) {
        const bool lacksCommand = description.app().get_subcommands().empty();
        throw Failure{
            ExitStatus::usage,
            (lacksCommand ? withoutSubcommand(description.app().remaining()) : error.what()) +
                hint};
    } catch (const CLI::ParseError& error) {
        throw Failure{ExitStatus::usage, error.what() + std::string{hint}};
    }
}

}  // namespace raidinfo
