#pragma once

#include <pthread.h>

#include <chrono>
#include <csignal>
#include <future>
#include <thread>
#include <type_traits>
#include <utility>

namespace raid::test {

// Runs a call that blocks on a thread of its own.
template <class Result>
class BlockedCall {
public:
    template <class Call>
    explicit BlockedCall(Call call) {
        std::packaged_task<Result()> task(std::move(call));
        result = task.get_future();
        thread = std::jthread(std::move(task));
    }

    // Waits for the call's result.
    Result wait() { return result.get(); }

    // The same, and breaks the system calls that the thread waits in by signals, so that it looks
    // at its flags at once. A signal can come before the wait begins: it is repeated.
    Result interrupt() {
        constexpr std::chrono::milliseconds pause{2};
        while (!returnsWithin(pause)) {
            nudge();
        }
        return result.get();
    }

    // One such signal; the call must not have returned, or its result not have been taken.
    void nudge() {
        struct sigaction ignoring {};
        ignoring.sa_handler = [](int) {};
        ignoring.sa_flags = SA_RESTART;
        sigaction(SIGUSR1, &ignoring, nullptr);
        pthread_kill(thread.native_handle(), SIGUSR1);
    }

    // Waits for the end of the call, but no longer than that.
    template <class Time>
    [[nodiscard]] bool returnsWithin(Time time) const {
        return result.wait_for(time) == std::future_status::ready;
    }

private:
    std::future<Result> result;
    std::jthread thread;
};

template <class Call>
BlockedCall(Call) -> BlockedCall<std::invoke_result_t<Call>>;

}  // namespace raid::test
