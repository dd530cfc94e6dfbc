#include "command_line/options.h"

#include <CLI/CLI.hpp>

#include "command_line/description.h"
#include "command_line/subcommands.h"
#include "exit_status.h"

namespace raidinfo {

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
            (lacksCommand ? "expected one of " + subcommandNames() : error.what()) + hint};
    } catch (const CLI::ParseError& error) {
        throw Failure{ExitStatus::usage, error.what() + std::string{hint}};
    }
}

}  // namespace raidinfo
