#include "signal_storm.h"

#include <unistd.h>

#include <cerrno>
#include <csignal>

#include "support/socket.h"

namespace raid::test {

SignalStorm::SignalStorm() {
    handled = 0;
    // Never destroyed: a last signal can come after the storm.
    static const int made = sem_init(&arrived, 0, 0);
    throwIfNegative(made, "create a semaphore");
    struct sigaction counting {};
    counting.sa_handler = [](int) {
        const int error = errno;
        ++handled;
        sem_post(&arrived);
        errno = error;
    };
    throwIfNegative(sigaction(SIGUSR2, &counting, nullptr), "handle a signal");
    sigevent event{};
    event.sigev_notify = SIGEV_THREAD_ID;
    event.sigev_signo = SIGUSR2;
    event._sigev_un._tid = gettid();
    throwIfNegative(timer_create(CLOCK_MONOTONIC, &event, &timer), "create a timer");
    constexpr timespec millisecond{.tv_sec = 0, .tv_nsec = 1'000'000};
    const itimerspec every{.it_interval = millisecond, .it_value = millisecond};
    throwIfNegative(timer_settime(timer, 0, &every, nullptr), "start a timer");
}

SignalStorm::~SignalStorm() { timer_delete(timer); }

void SignalStorm::waitFor(int more) const {
    while (sem_trywait(&arrived) == 0) {
        // Came before it was waited for.
    }
    while (more > 0) {
        more -= sem_wait(&arrived) == 0 ? 1 : 0;
    }
}

}  // namespace raid::test
