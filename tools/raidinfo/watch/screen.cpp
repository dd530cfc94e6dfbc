#include "watch/screen.h"

#include <fcntl.h>
#include <poll.h>
#include <unistd.h>

#include <chrono>
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

/// Whoever draws for longer waits for a terminal that takes nothing.
constexpr std::chrono::milliseconds longestDrawing{100};

/// The same terminal, but who writes there does not wait for it. Nothing where it is another
/// user's.
std::optional<Descriptor> openedImpatiently(int terminal) {
    const std::string name = "/proc/self/fd/" + std::to_string(terminal);
    const int opened = open(name.c_str(), O_WRONLY | O_NONBLOCK | O_NOCTTY | O_CLOEXEC);
    return opened < 0 ? std::nullopt
                      : std::optional<Descriptor>{std::in_place, opened, "cannot open a terminal"};
}

}  // namespace

Screen::Screen(const Output& destination, ColorChoice choice)
    : output{destination},
      colors{choice},
      inPlace{terminalOf(destination.descriptor(), choice).cursorMoves},
      impatient{inPlace ? openedImpatiently(destination.descriptor()) : std::nullopt} {
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
        try {
            output.write(leaveSequence);
        } catch (const std::exception&) {  // NOLINT(bugprone-empty-catch)
            // A terminal that is gone needs no tidying.
        }
    }
}

void Screen::show(Picture picture) {
    {
        const std::scoped_lock lock{drawing};
        const bool isFirst = !shown;
        shown = std::move(picture);
        if (!inPlace) {
            output.write((isFirst ? "" : "\n") + drawnBelow());
        } else if (!isAway) {
            output.write(drawnInPlace());
        }
    }
    while (isStale.exchange(false)) {
        const std::scoped_lock lock{drawing};
        if (!isAway) {
            output.write(drawnInPlace());
        }
    }
}

void Screen::writeAtOnce(std::string_view text) const noexcept {
    pollfd terminal{impatient ? impatient->get() : output.descriptor(), POLLOUT, 0};
    if (poll(&terminal, 1, 0) > 0) {
        [[maybe_unused]] const ssize_t written = ::write(terminal.fd, text.data(), text.size());
    }
}

void Screen::leave() noexcept {
    const std::unique_lock lock{drawing, longestDrawing};
    isAway = true;
    if (inPlace) {
        writeAtOnce(leaveSequence);
    }
}

void Screen::enter() noexcept {
    {
        const std::unique_lock lock{drawing, longestDrawing};
        isAway = false;
        if (inPlace) {
            writeAtOnce(enterSequence);
        }
    }
    redraw();
}

void Screen::redraw() noexcept {
    isStale = true;  // Whoever draws now looks for it afterwards.
    const std::unique_lock lock{drawing, std::try_to_lock};
    // A picture is longer than what a terminal is sure to take at once.
    if (lock && inPlace && !isAway && shown && impatient) {
        isStale = false;
        try {
            writeAtOnce(drawnInPlace());
        } catch (const std::exception&) {  // NOLINT(bugprone-empty-catch)
            // There is no memory; the next picture fails where it can be told.
        }
    }
}

/// Takes no lock, for the thread that has it may hang.
void Screen::abandon() const noexcept { writeAtOnce(leaveSequence); }

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
