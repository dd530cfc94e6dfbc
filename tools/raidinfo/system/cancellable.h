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

/// Whether the work that this thread does for a CancellableRun is to end early. What a signal
/// interrupts asks, lest it wait again.
[[nodiscard]] bool isCancelled() noexcept;

/// Runs work that blocks in the library on a thread of its own, and ends it early on SIGINT,
/// SIGTERM, SIGHUP or SIGQUIT. SIGTSTP stops the program when the guest of its terminal has left
/// that, which SIGWINCH has it redraw. Make it before the first other thread: it blocks all these
/// signals.
class CancellableRun {
public:
    CancellableRun();

    /// Runs `work`; what it throws is thrown here unless a signal ended it early, which is then
    /// returned. To end it, `cancel` is called again and again until the work has ended, since the
    /// library may lose a cancel, and each time a signal interrupts the system call that the work
    /// waits in. A second of the signals that end it ends the program at once; the guest of its
    /// terminal abandons that.
    std::optional<int> run(const std::function<void(std::stop_token)>& work,
                           const std::function<void()>& cancel);

private:
    Descriptor signals;
    Descriptor finished;  ///< readable once the work has ended
};

}  // namespace raidinfo
