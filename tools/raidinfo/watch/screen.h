#pragma once

#include <mutex>
#include <optional>
#include <string>
#include <vector>

#include "presentation/painter.h"
#include "presentation/terminal.h"
#include "system/output.h"
#include "system/terminal_guest.h"

namespace raidinfo {

struct ScreenLine {
    std::string text;
    Style style = Style::plain;
};

/// A picture that is drawn again in its place. On a terminal it has a screen of its own, and leaves
/// the one before as it was, also while the program is stopped; elsewhere one picture follows
/// another, with a blank line between.
class Screen {
public:
    Screen(const Output& destination, ColorChoice choice);
    Screen(const Screen&) = delete;
    Screen& operator=(const Screen&) = delete;
    ~Screen();

    /// Cuts what does not fit a terminal as it is now, and says how many lines that were.
    void show(const std::vector<ScreenLine>& lines);

private:
    void showInPlace(const std::vector<ScreenLine>& lines, const Terminal& terminal);
    void showBelow(const std::vector<ScreenLine>& lines, const Terminal& terminal);

    void write(std::string_view text) const noexcept;
    void leave() noexcept;
    void enter() noexcept;
    void abandon() const noexcept;

    const Output& output;
    ColorChoice colors;
    bool inPlace;
    bool drawnBefore = false;
    std::mutex drawing;  ///< the program may be stopped while it draws
    std::string picture;
    bool isAway = false;                 ///< stopped, or about to be
    std::optional<TerminalGuest> guest;  ///< while there is a screen of its own
};

}  // namespace raidinfo
