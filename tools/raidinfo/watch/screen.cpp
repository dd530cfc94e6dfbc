#include "watch/screen.h"

#include <poll.h>
#include <unistd.h>

#include <exception>
#include <string>
#include <utility>

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
                                   .redraw = [this] { redraw(); },
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
    {
        const std::scoped_lock lock{drawing};
        if (inPlace) {
            isAway = false;
            write(enterSequence);
        }
    }
    redraw();
}

/// On the thread that watches for signals, which must not wait for a terminal that takes nothing.
void Screen::redraw() noexcept {
    const std::unique_lock lock{drawing, std::try_to_lock};
    if (!lock) {
        isStale = true;
        return;
    }
    pollfd terminal{output.descriptor(), POLLOUT, 0};
    if (inPlace && !isAway && shown && poll(&terminal, 1, 0) > 0) {
        try {
            output.write(drawnInPlace());
        } catch (const std::exception&) {  // NOLINT(bugprone-empty-catch)
            // The next picture fails where it can be told.
        }
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

void Screen::show(Picture picture) {
    const std::scoped_lock lock{drawing};
    const bool isFirst = !shown;
    shown = std::move(picture);
    if (!inPlace) {
        output.write((isFirst ? "" : "\n") + drawnBelow());
    } else if (!isAway) {
        do {
            isStale = false;
            output.write(drawnInPlace());
        } while (isStale);
    }
}

std::string Screen::drawnInPlace() const {
    const Terminal terminal = terminalOf(output.descriptor(), colors);
    const Painter painter{terminal.colors};
    const std::size_t rows = terminal.height.value_or(1);
    const auto lines = fittedPicture(*shown, terminal.width.value_or(1), rows);
    std::string text = home;
    std::string_view separator;
    for (const auto& [line, style] : lines) {
        // Erased first: behind the last column some terminals would erase what stands in it.
        text.append(separator).append(restOfLine).append(painter(line, style));
        separator = "\r\n";
    }
    if (lines.size() < rows) {
        text.append(separator).append(restOfScreen);
    }
    return text;
}

std::string Screen::drawnBelow() const {
    const Painter painter{terminalOf(output.descriptor(), colors).colors};
    std::string text;
    for (const auto& [line, style] : wholePicture(*shown)) {
        text += painter(line, style) + "\n";
    }
    return text;
}

}  // namespace raidinfo
