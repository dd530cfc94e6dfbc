#pragma once

#include <condition_variable>
#include <mutex>
#include <stop_token>

namespace raid::test {

// Closed until somebody opens it, then open for good.
class Gate {
public:
    void open();
    // Returns whether the gate is open: false only when `stop` ended the wait.
    bool wait(const std::stop_token& stop);

private:
    std::mutex mutex;
    std::condition_variable_any opened;
    bool isOpen = false;
};

}  // namespace raid::test
