#include "system/blocking_io.h"

#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/socket.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <csignal>
#include <optional>
#include <stop_token>
#include <string>
#include <thread>

#include "system/cancellable.h"
#include "system/descriptor.h"

namespace raidinfo {
namespace {

/// Two ends of which nobody reads or writes the other.
struct Pair {
    Pair() {
        std::array<int, 2> ends{};
        if (socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, ends.data()) == 0) {
            here.emplace(ends[0], "no pair");
            there.emplace(ends[1], "no pair");
        }
    }
    std::optional<Descriptor> here;
    std::optional<Descriptor> there;
};

const std::string more(std::size_t{4} * 1024 * 1024, 'x');  // than a socket holds

TEST(BlockingIo, LeavesAWriteThatNobodyTakesWhenTheRunIsCancelled) {
    const Pair pair;
    bool written = true;
    int error = 0;
    CancellableRun{}.run(
        [&](const std::stop_token&) {
            kill(getpid(), SIGTERM);
            written = writeAll(pair.here->get(), more);
            error = errno;
        },
        [] {});
    EXPECT_FALSE(written);
    EXPECT_EQ(error, EINTR);
}

TEST(BlockingIo, LeavesAReadThatNothingComesToWhenTheRunIsCancelled) {
    const Pair pair;
    ssize_t size = 0;
    int error = 0;
    CancellableRun{}.run(
        [&](const std::stop_token&) {
            std::array<char, 8> room{};
            kill(getpid(), SIGTERM);
            size = readSome(pair.here->get(), room);
            error = errno;
        },
        [] {});
    EXPECT_EQ(size, -1);
    EXPECT_EQ(error, EINTR);
}

TEST(BlockingIo, FinishesWhatNeedsNoWaitAlsoWhenTheRunIsCancelled) {
    const Pair pair;
    bool written = false;
    CancellableRun{}.run(
        [&](const std::stop_token& stop) {
            kill(getpid(), SIGTERM);
            while (!stop.stop_requested()) {
                std::this_thread::yield();
            }
            written = writeAll(pair.here->get(), "the last words");
        },
        [] {});
    std::array<char, 32> room{};
    EXPECT_TRUE(written);
    EXPECT_EQ(readSome(pair.there->get(), room), 14);
}

TEST(BlockingIo, WaitsForAFileThatDoesNotWaitByItself) {
    const Pair pair;
    ASSERT_EQ(fcntl(pair.here->get(), F_SETFL, O_NONBLOCK), 0);
    bool written = false;
    std::size_t taken = 0;
    std::jthread writer{[&] { written = writeAll(pair.here->get(), more); }};
    std::array<char, 65536> room{};
    while (taken < more.size()) {
        const ssize_t size = readSome(pair.there->get(), room);
        ASSERT_GT(size, 0);
        taken += static_cast<std::size_t>(size);
    }
    writer.join();
    EXPECT_TRUE(written);
}

TEST(BlockingIo, LeavesAFileThatDoesNotWaitByItselfWhenTheRunIsCancelled) {
    const Pair pair;
    ASSERT_EQ(fcntl(pair.here->get(), F_SETFL, O_NONBLOCK), 0);
    bool written = true;
    CancellableRun{}.run(
        [&](const std::stop_token&) {
            kill(getpid(), SIGTERM);
            written = writeAll(pair.here->get(), more);
        },
        [] {});
    EXPECT_FALSE(written);
}

TEST(BlockingIo, TellsOfADescriptorThatIsNotOpen) {
    std::array<char, 8> room{};
    EXPECT_FALSE(writeAll(-1, "text"));
    EXPECT_EQ(errno, EBADF);
    EXPECT_EQ(readSome(-1, room), -1);
}

}  // namespace
}  // namespace raidinfo
