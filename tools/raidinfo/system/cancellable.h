#pragma once

#include <pthread.h>

#include <chrono>
#include <functional>
#include <optional>
#include <stop_token>

#include "system/descriptor.h"

namespace raidinfo {

/// How often a cancel is repeated until what it cancels has ended.
constexpr std::chrono::milliseconds cancelInterval{20};

/// Interrupts the system call that a thread waits in. Only once a CancellableRun was made.
void wake(pthread_t thread);

/// How a cancellable piece of work ended.
struct Ending {
    bool timedOut = false;
    std::optional<int> signal = std::nullopt;  ///< that interrupted the program
};

/// Runs work that blocks in the library on a thread of its own, and ends it early on SIGINT,
/// SIGTERM, SIGHUP, SIGQUIT or a time limit. SIGTSTP stops the program when the guest of its
/// terminal has left that. Make it before the first other thread: it blocks all these signals.
class CancellableRun {
public:
    CancellableRun();

    /// Runs `work`; what it throws is thrown here unless it was ended early. To end it, `cancel` is
    /// called again and again until the work has ended, since the library may lose a cancel, and
    /// each time a signal interrupts the system call that the work waits in. A second of the
    /// signals that end it ends the program at once; the guest of its terminal abandons that.
    Ending run(const std::function<void(std::stop_token)>& work,
               const std::function<void()>& cancel, std::optional<std::chrono::milliseconds> limit);

private:
    Descriptor signals;
    Descriptor finished;  ///< readable once the work has ended
};

}  // namespace raidinfo
