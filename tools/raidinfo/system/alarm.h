#pragma once

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
    Alarm(std::optional<std::chrono::milliseconds> after, std::function<void()> cancel);

    /// Requested to stop once the time is over.
    [[nodiscard]] std::stop_token over() const { return timeIsOver.get_token(); }

private:
    std::stop_source timeIsOver;
    std::jthread clock;
};

}  // namespace raidinfo
