#include "signal_storm.h"

#include <unistd.h>

#include <chrono>
#include <csignal>
#include <thread>

#include "support/socket.h"

namespace raid::test {

SignalStorm::SignalStorm() {
    handled = 0;
    struct sigaction counting {};
    counting.sa_handler = [](int) { ++handled; };
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
    // What a signal handler may do does not include waking a waiter.
    constexpr std::chrono::milliseconds signalPeriod{1};
    for (const int end = handled + more; handled < end;) {
        std::this_thread::sleep_for(signalPeriod);
    }
}

}  // namespace raid::test
