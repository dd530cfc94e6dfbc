#pragma once

#include <string>
#include <vector>

#include "presentation/painter.h"
#include "presentation/terminal.h"
#include "system/output.h"

namespace raidinfo {

struct ScreenLine {
    std::string text;
    Style style = Style::plain;
};

/// A picture that is drawn again in its place. On a terminal it has a screen of its own, and leaves
/// the one before as it was; elsewhere one picture follows another, with a blank line between.
class Screen {
public:
    Screen(const Output& destination, ColorChoice choice);
    Screen(const Screen&) = delete;
    Screen& operator=(const Screen&) = delete;
    ~Screen();

    /// Cuts what does not fit a terminal as it is now, and says how many lines that were.
    void show(const std::vector<ScreenLine>& lines);

private:
    void showInPlace(const std::vector<ScreenLine>& lines, const Terminal& terminal) const;
    void showBelow(const std::vector<ScreenLine>& lines, const Terminal& terminal);

    const Output& output;
    ColorChoice colors;
    bool inPlace;
    bool drawnBefore = false;
};

}  // namespace raidinfo
