#pragma once

#include <semaphore.h>

#include <atomic>
#include <ctime>

namespace raid::test {

// A signal every millisecond for the thread that makes this, with a handler that restarts no system
// call, for as long as it lives.
class SignalStorm {
public:
    SignalStorm();
    SignalStorm(const SignalStorm&) = delete;
    SignalStorm& operator=(const SignalStorm&) = delete;
    ~SignalStorm();

    // Waits for so many more signals; for one other thread at a time than the one that gets them.
    void waitFor(int more) const;

    // The signals since the storm began.
    [[nodiscard]] static int count() { return handled; }

private:
    inline static std::atomic<int> handled{0};
    inline static sem_t arrived{};
    timer_t timer{};
};

}  // namespace raid::test
