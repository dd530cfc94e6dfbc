// A host as it is meant to be: one thread for the inventory, one for the events, and now and then
// a cancel from a third.

#include <fcntl.h>
#include <gtest/gtest.h>
#include <unistd.h>

#include <atomic>
#include <chrono>
#include <filesystem>
#include <random>
#include <set>
#include <string>
#include <thread>

#include "RAIDInstrumentation.h"
#include "support/blocked_call.h"
#include "support/fresh_library.h"
#include "tools/raidsim/program.h"

namespace {

using namespace raid::test;

constexpr std::chrono::seconds duration{RAID_TWO_THREADS_SECONDS};

std::set<int> openDescriptors() {
    std::set<int> open;
    for (const auto& entry : std::filesystem::directory_iterator("/proc/self/fd")) {
        open.insert(std::stoi(entry.path().filename().string()));
    }
    // The one that the directory was read through is closed now.
    std::erase_if(open, [](int descriptor) { return fcntl(descriptor, F_GETFD) < 0; });
    return open;
}

// Every cancelled wait leaves its socket open. Returns how many.
int closeAllBut(const std::set<int>& before) {
    int closed = 0;
    for (const int descriptor : openDescriptors()) {
        if (!before.contains(descriptor)) {
            closed += ::close(descriptor) == 0 ? 1 : 0;
        }
    }
    return closed;
}

class TwoThreads : public FreshLibrary {
protected:
    TwoThreads() { EXPECT_EQ(simulator.readLine(), "raidsim: listening on 127.0.0.1:34572"); }

    // Reads the configuration again and again, as an agent does.
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

    // Follows the events, each of which must come once and in order.
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
    std::random_device device;
    const auto seed = device();
    RecordProperty("seed", std::to_string(seed));
    SCOPED_TRACE("seed " + std::to_string(seed));
    std::mt19937 random(seed);
    std::uniform_int_distribution<int> microseconds(0, 20'000);
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
