#include "watch/screen.h"

#include <poll.h>
#include <unistd.h>

#include <algorithm>
#include <exception>
#include <string_view>

#include "text/width.h"

namespace raidinfo {
namespace {

constexpr std::string_view enterSequence = "\x1b[?1049h\x1b[?25l";
constexpr std::string_view leaveSequence = "\x1b[?25h\x1b[?1049l";
constexpr auto home = "\x1b[H";
constexpr auto restOfLine = "\x1b[K";
constexpr auto restOfScreen = "\x1b[J";

}  // namespace

Screen::Screen(const Output& destination, ColorChoice choice)
    : output{destination},
      colors{choice},
      inPlace{terminalOf(destination.descriptor(), choice).cursorMoves} {
    if (inPlace) {
        guest.emplace(TerminalActs{.leave = [this] { leave(); },
                                   .enter = [this] { enter(); },
                                   .abandon = [this] { abandon(); }});
        output.write(enterSequence);
    }
}

Screen::~Screen() {
    if (inPlace) {
        const std::scoped_lock lock{drawing};
        inPlace = false;
        write(leaveSequence);
    }
}

void Screen::write(std::string_view text) const noexcept {
    try {
        output.write(text);
    } catch (const std::exception&) {  // NOLINT(bugprone-empty-catch)
        // A terminal that is gone needs no tidying.
    }
}

void Screen::leave() noexcept {
    const std::scoped_lock lock{drawing};
    if (inPlace) {
        isAway = true;
        write(leaveSequence);
    }
}

void Screen::enter() noexcept {
    const std::scoped_lock lock{drawing};
    if (inPlace) {
        isAway = false;
        write(enterSequence);
        write(picture);
    }
}

/// Takes no lock, for the thread that has it may hang; nor does it wait for the terminal.
void Screen::abandon() const noexcept {
    pollfd terminal{output.descriptor(), POLLOUT, 0};
    if (poll(&terminal, 1, 0) > 0) {
        [[maybe_unused]] const ssize_t written =
            ::write(terminal.fd, leaveSequence.data(), leaveSequence.size());
    }
}

void Screen::show(const std::vector<ScreenLine>& lines) {
    const Terminal terminal = terminalOf(output.descriptor(), colors);
    if (inPlace) {
        showInPlace(lines, terminal);
    } else {
        showBelow(lines, terminal);
    }
}

void Screen::showInPlace(const std::vector<ScreenLine>& lines, const Terminal& terminal) {
    const Painter painter{terminal.colors};
    const std::size_t room = std::max<std::size_t>(terminal.height.value_or(0), 2);
    const std::size_t shown = lines.size() > room ? room - 1 : lines.size();
    std::string text = home;
    for (std::size_t index = 0; index < shown; ++index) {
        const auto& [line, style] = lines[index];
        text += (index == 0 ? "" : "\r\n") +
                painter(shortened(line, terminal.width.value_or(line.size())), style) + restOfLine;
    }
    if (shown < lines.size()) {
        text += "\r\n" + std::to_string(lines.size() - shown) + " more lines" + restOfLine;
    }
    const std::scoped_lock lock{drawing};
    picture = text + restOfScreen;
    if (!isAway) {
        output.write(picture);
    }
}

void Screen::showBelow(const std::vector<ScreenLine>& lines, const Terminal& terminal) {
    const Painter painter{terminal.colors};
    std::string text = drawnBefore ? "\n" : "";
    for (const auto& [line, style] : lines) {
        text += painter(line, style) + "\n";
    }
    drawnBefore = true;
    output.write(text);
}

}  // namespace raidinfo
