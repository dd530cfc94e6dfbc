// A host as it is meant to be: one thread for the inventory, one for the events, and now and then
// a cancel from a third.

#include <gtest/gtest.h>
#include <unistd.h>

#include <atomic>
#include <chrono>
#include <cstdlib>
#include <map>
#include <random>
#include <string>
#include <thread>

#include "RAIDInstrumentation.h"
#include "support/blocked_call.h"
#include "support/fresh_library.h"
#include "support/open_descriptors.h"
#include "tools/raidsim/program.h"

namespace {

using namespace raid::test;

constexpr std::chrono::seconds duration{RAID_TWO_THREADS_SECONDS};

// Every cancelled wait leaves its socket open. Returns how many.
int closeAllBut(const std::map<int, std::string>& before) {
    int closed = 0;
    for (const auto& [descriptor, target] : openDescriptors()) {
        if (!before.contains(descriptor)) {
            closed += ::close(descriptor) == 0 ? 1 : 0;
        }
    }
    return closed;
}

// The one of an earlier run, if the environment names it.
unsigned chosenSeed() {
    const char* const given = std::getenv("RAID_TEST_SEED");
    return given == nullptr ? std::random_device()() : static_cast<unsigned>(std::stoul(given));
}

class TwoThreads : public FreshLibrary {
protected:
    TwoThreads() { EXPECT_EQ(simulator.readLine(), "raidsim: listening on 127.0.0.1:34572"); }

    // Reads the configuration again and again, as an agent does. A cancel ends whichever exchange
    // is waiting, this one too: then the lists stay what they were.
    int readInventory() const {
        int refreshes = 0;
        while (!over) {
            setRefreshFlag();
            const int drives = getRAIDDiskDriveCount();
            EXPECT_EQ(drives, 6);
            for (int position = 0; position < drives; ++position) {
                char serialNumber[64] = {};
                getRAIDDiskDriveSerialNumber(serialNumber, position);
                EXPECT_NE(*serialNumber, '\0');
            }
            ++refreshes;
        }
        return refreshes;
    }

    // Follows the events, of which none may be left out.
    int followEvents() const {
        int seen = 0;
        while (!over) {
            setRAIDEventSequenceNumber(seen + 1);
            getEvent();
            for (int position = 0; position < getRAIDEventCount(); ++position) {
                const int number = getRAIDEventSequenceNumber(position);
                // A cancelled wait publishes the last batch once more.
                EXPECT_LE(number, seen + 1);
                seen = std::max(seen, number);
            }
        }
        return seen;
    }

    raidsim::test::Program simulator{{RAID_EXAMPLES "/small-server.xml"}};
    std::atomic<bool> over{false};
};

TEST_F(TwoThreads, WorkSideBySideWithCancelsAtAnyMoment) {
    const auto seed = chosenSeed();
    SCOPED_TRACE("RAID_TEST_SEED=" + std::to_string(seed));
    std::mt19937 random(seed);
    std::uniform_int_distribution<int> microseconds(0, 20'000);
    RAIDinit();
    ASSERT_EQ(getRAIDDiskDriveCount(), 6);
    const auto before = openDescriptors();

    BlockedCall inventory([this] { return readInventory(); });
    BlockedCall events([this] { return followEvents(); });
    int added = 0;
    int cancels = 0;
    const auto end = std::chrono::steady_clock::now() + duration;
    while (std::chrono::steady_clock::now() < end) {
        if (random() % 4 == 0) {
            cancelGetEvent();
            ++cancels;
        } else {
            simulator.type("event type=Information\n");
            ++added;
        }
        EXPECT_FALSE(events.returnsWithin(std::chrono::microseconds(microseconds(random))));
        events.nudge();
    }
    over = true;
    cancelGetEvent();
    const int seen = events.interrupt();
    EXPECT_GT(inventory.wait(), 0);
    EXPECT_GT(seen, 0);
    EXPECT_LE(seen, added);
    EXPECT_LE(closeAllBut(before), cancels + 1);
}

}  // namespace
