#pragma once

#include <chrono>
#include <stop_token>

namespace raidinfo {

/// Pauses between attempts, each twice as long as the one before, until something succeeds.
class Backoff {
public:
    /// Returns at once when stop is requested.
    void wait(const std::stop_token& stop);
    void reset() noexcept { pause = shortest; }

private:
    static constexpr std::chrono::milliseconds shortest{200};
    static constexpr std::chrono::milliseconds longest{10'000};

    std::chrono::milliseconds pause = shortest;
};

/// Sleeps so long, or until stop is requested.
void pauseUnlessStopped(std::chrono::milliseconds duration, const std::stop_token& stop);

}  // namespace raidinfo
