#include "system/alarm.h"

#include <utility>

#include "system/backoff.h"
#include "system/cancellable.h"

namespace raidinfo {

Alarm::Alarm(std::optional<std::chrono::milliseconds> after, std::function<void()> cancel,
             const std::stop_token& stop)
    : stopped{stop, [this] { end.request_stop(); }} {
    if (!after) {
        return;
    }
    clock = std::jthread{[this, time = *after, cancel = std::move(cancel),
                          waiting = pthread_self()](const std::stop_token& ended) {
        pauseUnlessStopped(time, ended);
        if (!ended.stop_requested()) {
            timeIsOver = true;
            end.request_stop();
        }
        while (!ended.stop_requested()) {
            cancel();
            wake(waiting);
            pauseUnlessStopped(cancelInterval, ended);
        }
    }};
}

}  // namespace raidinfo
