#pragma once

#include <chrono>
#include <functional>
#include <thread>

namespace raidinfo {

/// Ends what the thread that makes it waits for in the library, once so much time is over: from
/// then on it calls `cancel`, again and again, for the library may lose a cancel.
class Alarm {
public:
    Alarm(std::chrono::milliseconds after, std::function<void()> cancel);

private:
    std::jthread clock;
};

}  // namespace raidinfo
