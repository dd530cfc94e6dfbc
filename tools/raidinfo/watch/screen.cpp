#include "watch/screen.h"

#include <algorithm>
#include <exception>

#include "presentation/text.h"

namespace raidinfo {
namespace {

constexpr auto enter = "\x1b[?1049h\x1b[?25l";
constexpr auto leave = "\x1b[?25h\x1b[?1049l";
constexpr auto home = "\x1b[H";
constexpr auto restOfLine = "\x1b[K";
constexpr auto restOfScreen = "\x1b[J";

}  // namespace

Screen::Screen(const Output& destination, ColorChoice choice)
    : output{destination},
      colors{choice},
      inPlace{terminalOf(destination.descriptor(), choice).cursorMoves} {
    if (inPlace) {
        output.write(enter);
    }
}

Screen::~Screen() {
    if (inPlace) {
        try {
            output.write(leave);
        } catch (const std::exception&) {  // NOLINT(bugprone-empty-catch)
            // A terminal that is gone needs no tidying.
        }
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

void Screen::showInPlace(const std::vector<ScreenLine>& lines, const Terminal& terminal) const {
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
    output.write(text + restOfScreen);
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
