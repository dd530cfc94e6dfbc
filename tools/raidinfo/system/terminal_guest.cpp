#include "system/terminal_guest.h"

#include <mutex>
#include <utility>

namespace raidinfo {
namespace {

/// Signals come to the process, so it has one guest at most.
struct Presence {
    std::mutex mutex;
    const TerminalActs* acts = nullptr;
};

Presence& presence() {
    static Presence only;
    return only;
}

void announce(const TerminalActs* acts) {
    const std::scoped_lock lock{presence().mutex};
    presence().acts = acts;
}

void perform(std::function<void()> TerminalActs::*act) {
    const std::scoped_lock lock{presence().mutex};
    if (presence().acts != nullptr) {
        (presence().acts->*act)();
    }
}

}  // namespace

TerminalGuest::TerminalGuest(TerminalActs whatToDo) : acts{std::move(whatToDo)} { announce(&acts); }

TerminalGuest::~TerminalGuest() { announce(nullptr); }

void leaveTerminal() { perform(&TerminalActs::leave); }
void enterTerminal() { perform(&TerminalActs::enter); }
void redrawTerminal() { perform(&TerminalActs::redraw); }
void abandonTerminal() { perform(&TerminalActs::abandon); }

}  // namespace raidinfo
