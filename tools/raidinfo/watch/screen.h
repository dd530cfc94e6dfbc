#pragma once

#include <atomic>
#include <mutex>
#include <optional>
#include <string>
#include <string_view>

#include "presentation/terminal.h"
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

    void write(std::string_view text) const noexcept;
    void redraw() noexcept;
    void leave() noexcept;
    void enter() noexcept;
    void abandon() const noexcept;

    const Output& output;
    ColorChoice colors;
    bool inPlace;
    std::mutex drawing;  ///< the program may be stopped, or the terminal change, while it draws
    std::optional<Picture> shown;
    std::atomic<bool> isStale = false;   ///< the terminal changed while it was drawn
    bool isAway = false;                 ///< stopped, or about to be
    std::optional<TerminalGuest> guest;  ///< while there is a screen of its own
};

}  // namespace raidinfo
