#pragma once

#include <functional>

namespace raidinfo {

/// What is done to a terminal that the program has changed. None of it may throw.
struct TerminalActs {
    std::function<void()> leave;    ///< before the program is stopped
    std::function<void()> enter;    ///< once it goes on
    std::function<void()> redraw;   ///< when its size has changed; must wait for nobody
    std::function<void()> abandon;  ///< before it ends at once; must wait for nobody
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
