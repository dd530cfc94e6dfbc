#pragma once

#include <atomic>
#include <chrono>
#include <functional>
#include <optional>
#include <stop_token>
#include <thread>

namespace raidinfo {

/// Ends what the thread that makes it waits for in the library, once so much time is over: from
/// then on it calls `cancel`, again and again, for the library may lose a cancel. Without a time it
/// never does.
class Alarm {
public:
    Alarm(std::optional<std::chrono::milliseconds> after, std::function<void()> cancel,
          const std::stop_token& stop = {});
    Alarm(const Alarm&) = delete;
    Alarm& operator=(const Alarm&) = delete;
    ~Alarm() = default;

    /// Requested to stop once the time is over, or when `stop` is.
    [[nodiscard]] std::stop_token over() const { return end.get_token(); }

    /// Whether the time is over.
    [[nodiscard]] bool rang() const noexcept { return timeIsOver; }

private:
    std::stop_source end;
    std::stop_callback<std::function<void()>> stopped;
    std::atomic<bool> timeIsOver = false;
    std::jthread clock;  ///< the last member: it uses the others
};

}  // namespace raidinfo
