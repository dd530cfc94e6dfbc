#include "system/backoff.h"

#include <algorithm>
#include <condition_variable>
#include <mutex>

namespace raidinfo {

void Backoff::wait(const std::stop_token& stop) {
    pauseUnlessStopped(pause, stop);
    pause = std::min(2 * pause, longest);
}

void pauseUnlessStopped(std::chrono::milliseconds duration, const std::stop_token& stop) {
    std::mutex mutex;
    std::condition_variable_any never;
    std::unique_lock lock{mutex};
    never.wait_for(lock, stop, duration, [] { return false; });
}

}  // namespace raidinfo
