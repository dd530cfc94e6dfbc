#include "system/cancellable.h"

#include <gtest/gtest.h>
#include <poll.h>
#include <unistd.h>

#include <atomic>
#include <cerrno>
#include <csignal>
#include <cstdlib>
#include <functional>
#include <future>
#include <stdexcept>
#include <string_view>
#include <utility>

#include "system/terminal_guest.h"

namespace raidinfo {
namespace {

void noCancel() { FAIL() << "cancelled"; }

TEST(CancellableRun, EndsWithTheWork) {
    bool done = false;
    const auto signal =
        CancellableRun{}.run([&done](const std::stop_token&) { done = true; }, noCancel);
    EXPECT_TRUE(done);
    EXPECT_EQ(signal, std::nullopt);
}

TEST(CancellableRun, PassesOnWhatTheWorkThrows) {
    CancellableRun run;
    EXPECT_THROW(run.run([](const std::stop_token&) { throw std::domain_error{"no"}; }, noCancel),
                 std::domain_error);
}

TEST(CancellableRun, RepeatsTheCancelUntilTheWorkHasEnded) {
    std::atomic<int> cancels = 0;
    CancellableRun{}.run(
        [&cancels](const std::stop_token&) {
            kill(getpid(), SIGTERM);
            for (int seen = cancels; seen < 3; seen = cancels) {
                cancels.wait(seen);
            }
        },
        [&cancels] {
            ++cancels;
            cancels.notify_all();
        });
    EXPECT_GE(cancels, 3);
}

TEST(CancellableRun, InterruptsTheSystemCallThatTheWorkWaitsIn) {
    int result = 0;
    int error = 0;
    CancellableRun{}.run(
        [&](const std::stop_token& stop) {
            kill(getpid(), SIGTERM);
            do {
                result = poll(nullptr, 0, -1);
                error = errno;
            } while (!stop.stop_requested());
        },
        [] {});
    EXPECT_EQ(result, -1);
    EXPECT_EQ(error, EINTR);
}

TEST(CancellableRun, ReportsTheSignalThatEndedIt) {
    for (const int signal : {SIGINT, SIGTERM, SIGHUP, SIGQUIT}) {
        // As a shell's background job the test would have inherited that some are ignored.
        std::signal(signal, SIG_DFL);
        CancellableRun run;
        std::promise<void> cancelled;
        const auto ending = run.run(
            [signal, &cancelled](const std::stop_token&) {
                kill(getpid(), signal);
                cancelled.get_future().wait();
                throw std::domain_error{"a failure of work that was cancelled means nothing"};
            },
            [&cancelled, first = true]() mutable {
                if (std::exchange(first, false)) {
                    cancelled.set_value();
                }
            });
        EXPECT_EQ(ending, signal);
    }
}

TEST(CancellableRun, HeedsThatAHangupIsIgnored) {
    std::signal(SIGHUP, SIG_IGN);
    const auto signal =
        CancellableRun{}.run([](const std::stop_token&) { kill(getpid(), SIGHUP); }, noCancel);
    std::signal(SIGHUP, SIG_DFL);
    EXPECT_EQ(signal, std::nullopt);
}

std::function<void()> saying(std::string_view text) {
    return [text] { static_cast<void>(!write(STDERR_FILENO, text.data(), text.size())); };
}

[[noreturn]] void runUntilASecondSignal() {
    const TerminalGuest guest{
        {saying("left"), saying("entered"), saying("redrawn"), saying("abandoned")}};
    CancellableRun run;
    run.run(
        [](const std::stop_token&) {
            kill(getpid(), SIGINT);
            while (true) {
                pause();
            }
        },
        [] { kill(getpid(), SIGINT); });
    std::abort();
}

TEST(CancellableRun, AbandonsTheTerminalAtASecondSignal) {
    GTEST_FLAG_SET(death_test_style, "threadsafe");
    EXPECT_EXIT(runUntilASecondSignal(), testing::ExitedWithCode(128 + SIGINT), "^abandoned$");
}

TEST(CancellableRun, IsEndedAtOnceByASecondSignal) {
    GTEST_FLAG_SET(death_test_style, "threadsafe");
    EXPECT_EXIT(
        {
            CancellableRun run;
            run.run(
                [](const std::stop_token&) {
                    kill(getpid(), SIGINT);
                    while (true) {
                        pause();
                    }
                },
                [] { kill(getpid(), SIGTERM); });
        },
        testing::ExitedWithCode(128 + SIGTERM), "");
}

}  // namespace
}  // namespace raidinfo
