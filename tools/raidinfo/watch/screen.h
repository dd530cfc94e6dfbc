#pragma once

#include <atomic>
#include <mutex>
#include <optional>
#include <string>
#include <string_view>

#include "presentation/terminal.h"
#include "system/descriptor.h"
#include "system/output.h"
#include "system/terminal_guest.h"
#include "watch/picture.h"

namespace raidinfo {

/// A picture that is drawn again in its place. On a terminal it has a screen of its own, follows
/// its size, and leaves the one before as it was, also while the program is stopped; elsewhere one
/// picture follows another, with a blank line between.
class Screen {
public:
    Screen(const Output& destination, ColorChoice choice);
    Screen(const Screen&) = delete;
    Screen& operator=(const Screen&) = delete;
    ~Screen();

    void show(Picture picture);

private:
    [[nodiscard]] std::string drawnInPlace() const;
    [[nodiscard]] std::string drawnBelow() const;

    // The acts of the thread that watches for signals: they wait neither for the terminal nor, for
    // longer than it takes to draw, for the thread that draws.
    void redraw() noexcept;
    void leave() noexcept;
    void enter() noexcept;
    void abandon() const noexcept;

    /// As much as the terminal takes.
    void writeAtOnce(std::string_view text) const noexcept;

    const Output& output;
    ColorChoice colors;
    bool inPlace;
    std::optional<Descriptor> impatient;  ///< for who may not wait for the terminal
    std::timed_mutex drawing;
    std::optional<Picture> shown;
    std::atomic<bool> isStale = false;   ///< the terminal changed while it was drawn
    std::atomic<bool> isAway = false;    ///< stopped, or about to be
    std::optional<TerminalGuest> guest;  ///< while there is a screen of its own
};

}  // namespace raidinfo
