#include "system/alarm.h"

#include <stop_token>
#include <utility>

#include "system/backoff.h"
#include "system/cancellable.h"

namespace raidinfo {

Alarm::Alarm(std::optional<std::chrono::milliseconds> after, std::function<void()> cancel) {
    if (!after) {
        return;
    }
    clock = std::jthread{[time = *after, cancel = std::move(cancel), waiting = pthread_self(),
                          source = timeIsOver](const std::stop_token& stop) mutable {
        pauseUnlessStopped(time, stop);
        if (!stop.stop_requested()) {
            source.request_stop();
        }
        while (!stop.stop_requested()) {
            cancel();
            wake(waiting);
            pauseUnlessStopped(cancelInterval, stop);
        }
    }};
}

}  // namespace raidinfo
