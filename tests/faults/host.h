#pragma once

#include <cstddef>
#include <filesystem>
#include <memory>
#include <string>
#include <vector>

#include "fault/fault.h"
#include "model/system_and_adapter.h"
#include "simulator.h"

namespace raid::test {

// The threads of this process when it was made, and whether there are as many again.
class ThreadCount {
public:
    ThreadCount();

    // Waits a little for it: the kernel lists a thread for a moment after it was joined.
    [[nodiscard]] bool isReachedAgain() const;

private:
    std::size_t before = 0;
};

// The library in this process, with a configuration and a batch of events that were good.
class Host {
public:
    explicit Host(Simulator& served);

    // Begins with a good configuration, and good events, that are not quite what the service has,
    // so that it shows whether the case replaces them.
    void startGood(const raidsim::FaultOutcome& outcome);

    // Makes the call at this log level, and cancels it once the service stalls if the case says so.
    // Returns the call's result.
    int call(const raidsim::FaultOutcome& outcome, int level);

    [[nodiscard]] raidsim::Fate configuration() const;
    [[nodiscard]] raidsim::Fate events() const;
    // The log of the last call; the number of the socket's descriptor is left out.
    [[nodiscard]] static std::string log();
    // Whether a good answer publishes what it did at first.
    [[nodiscard]] bool isGoodAgain();

private:
    static void refreshGood();
    void markEvents();

    Simulator& simulator;
    std::string published;
    std::string marked;  // the same with another speed of a channel
    std::unique_ptr<RAIDSystem> markedSystem;
    std::vector<RAIDChannel> markedChannels;
    std::vector<int> eventsBefore;
};

}  // namespace raid::test
