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
        struct sigaction ignoring {};
        ignoring.sa_handler = [](int) {};
        ignoring.sa_flags = SA_RESTART;
        sigaction(SIGUSR1, &ignoring, nullptr);
        constexpr std::chrono::milliseconds pause{2};
        while (result.wait_for(pause) != std::future_status::ready) {
            pthread_kill(thread.native_handle(), SIGUSR1);
        }
        return result.get();
    }

private:
    std::future<Result> result;
    std::jthread thread;
};

template <class Call>
BlockedCall(Call) -> BlockedCall<std::invoke_result_t<Call>>;

}  // namespace raid::test
