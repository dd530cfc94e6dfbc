#pragma once

#include <functional>

namespace raidinfo {

/// What is done to a terminal that the program has changed. None of it may throw, nor wait for the
/// terminal or for a thread that does: as long as it did, no signal would be heard.
struct TerminalActs {
    std::function<void()> leave;    ///< before the program is stopped
    std::function<void()> enter;    ///< once it goes on
    std::function<void()> redraw;   ///< when its size has changed
    std::function<void()> abandon;  ///< before it ends at once
};

/// Has the acts done while it lives, by the thread that watches for signals. One at a time.
class TerminalGuest {
public:
    explicit TerminalGuest(TerminalActs whatToDo);
    TerminalGuest(const TerminalGuest&) = delete;
    TerminalGuest& operator=(const TerminalGuest&) = delete;
    ~TerminalGuest();

private:
    TerminalActs acts;
};

// Do the act of the guest there is, if any.
void leaveTerminal();
void enterTerminal();
void redrawTerminal();
void abandonTerminal();

}  // namespace raidinfo
