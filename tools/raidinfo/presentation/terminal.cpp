#include "presentation/terminal.h"

#include <sys/ioctl.h>
#include <unistd.h>

#include <cstdlib>
#include <string_view>

namespace raidinfo {
namespace {

constexpr std::size_t usualWidth = 80;
constexpr std::size_t usualHeight = 24;

std::string_view environment(const char* name) {
    // The program changes no environment, whatever its threads.
    const char* const value = std::getenv(name);  // NOLINT(concurrency-mt-unsafe)
    return value == nullptr ? "" : value;
}

bool understandsControlSequences() {
    const std::string_view type = environment("TERM");
    return !type.empty() && type != "dumb";
}

}  // namespace

Terminal terminalOf(int descriptor, ColorChoice choice) {
    Terminal terminal;
    if (isatty(descriptor) != 0) {
        winsize size{};
        const bool known = ioctl(descriptor, TIOCGWINSZ, &size) == 0;
        terminal.width = known && size.ws_col > 0 ? size.ws_col : usualWidth;
        terminal.height = known && size.ws_row > 0 ? size.ws_row : usualHeight;
        terminal.cursorMoves = understandsControlSequences();
    }
    const bool wanted = terminal.cursorMoves && environment("NO_COLOR").empty();
    terminal.colors = choice == ColorChoice::always || (choice == ColorChoice::automatic && wanted);
    return terminal;
}

}  // namespace raidinfo
