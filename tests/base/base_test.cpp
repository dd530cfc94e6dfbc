// The small things that everything stands on.

#include <fcntl.h>
#include <gtest/gtest.h>
#include <pthread.h>
#include <sys/resource.h>
#include <unistd.h>

#include <chrono>
#include <climits>
#include <optional>
#include <string>
#include <vector>

#include "base/decimal.h"
#include "base/defer_cancellation.h"
#include "base/file_descriptor.h"
#include "base/regular_file.h"
#include "base/stream_socket.h"
#include "support/busy_service.h"
#include "support/files.h"

namespace {

using namespace raid::base;
using namespace raid::test;

TEST(DecimalNumber, IsReadFromTheFrontOfTheTextAndClamped) {
    struct Case {
        std::string text;
        int number;
    };
    const std::vector<Case> cases{
        {"", 0},
        {"12", 12},
        {" \t\n\v\f\r12 ", 12},
        {"-12", -12},
        {"+12", 12},
        {"--12", 0},
        {"- 12", 0},
        {"12abc", 12},
        {"abc12", 0},
        {"0x10", 0},
        {"007", 7},
        {"2147483647", INT_MAX},
        {"2147483648", INT_MAX},
        {"-2147483648", INT_MIN},
        {"-2147483649", INT_MIN},
        {std::string(40, '9'), INT_MAX},
        {"-" + std::string(40, '9'), INT_MIN},
        {std::string(40, '0') + "5", 5},
    };
    for (const auto& [text, number] : cases) {
        EXPECT_EQ(decimalNumber(text), number) << text;
    }
}

TEST(DecimalNumber, IsPrecededByNothingButSpaceAndASign) {
    constexpr std::string_view passedOver = " \t\n\v\f\r+0123456789-";
    for (int byte = 0; byte < 256; ++byte) {
        const char c = static_cast<char>(byte);
        if (passedOver.find(c) == std::string_view::npos) {
            EXPECT_EQ(decimalNumber(std::string{c, '5'}), 0) << byte;
            EXPECT_EQ(decimalNumber(std::string{'5', c, '5'}), 5) << byte;
        }
    }
}

bool isOpen(int descriptor) { return fcntl(descriptor, F_GETFD) != -1; }

int openNull() { return open("/dev/null", O_RDONLY | O_CLOEXEC); }

TEST(FileDescriptor, IsClosedByItsLastOwner) {
    const int number = openNull();
    {
        FileDescriptor first(number);
        const FileDescriptor second(std::move(first));
        EXPECT_EQ(second.get(), number);
        EXPECT_TRUE(isOpen(number));
    }
    EXPECT_FALSE(isOpen(number));
}

TEST(FileDescriptor, ClosesWhatItHeldWhenItIsAssigned) {
    const int old = openNull();
    const int next = openNull();
    FileDescriptor descriptor(old);
    descriptor = FileDescriptor(next);
    EXPECT_FALSE(isOpen(old));
    EXPECT_TRUE(isOpen(next));
}

TEST(FileDescriptor, LeavesOpenWhatItReleases) {
    const int number = openNull();
    { EXPECT_EQ(FileDescriptor(number).release(), number); }
    EXPECT_TRUE(isOpen(number));
    close(number);
}

TEST(RegularFile, IsReadInPiecesOfAnySize) {
    writeFile("file", "0123456789");
    const auto file = RegularFile::open("file");
    ASSERT_TRUE(file);
    EXPECT_EQ(file->size(), 10U);
    std::string buffer(7, '\0');
    EXPECT_EQ(file->read(buffer), 7U);
    EXPECT_EQ(buffer, "0123456");
    EXPECT_EQ(file->read(buffer), 3U) << "the file ends";
    EXPECT_EQ(buffer.substr(0, 3), "789");
}

TEST(RegularFile, RefusesEverythingElseWithoutWaiting) {
    EXPECT_FALSE(RegularFile::open("missing"));
    EXPECT_FALSE(RegularFile::open("."));
    EXPECT_FALSE(RegularFile::open("/dev/null"));
    makePipe("pipe");
    EXPECT_FALSE(RegularFile::open("pipe"));
}

constexpr std::chrono::milliseconds slice{5};

TEST(StreamSocket, FailsToConnectWhereNobodyListens) {
    const StreamSocket socket;
    EXPECT_GE(socket.handle(), 0);
    EXPECT_NE(fcntl(socket.handle(), F_GETFD) & FD_CLOEXEC, 0) << "no child inherits it";
    EXPECT_LT(socket.connect("127.0.0.1", 1, slice), 0);
}

TEST(StreamSocket, FailsToConnectWhenNoDescriptorIsLeft) {
    rlimit before{};
    ASSERT_EQ(getrlimit(RLIMIT_NOFILE, &before), 0);
    const rlimit none{0, before.rlim_max};
    ASSERT_EQ(setrlimit(RLIMIT_NOFILE, &none), 0);
    const StreamSocket socket;
    EXPECT_LT(socket.handle(), 0);
    EXPECT_LT(socket.connect("127.0.0.1", 1, slice), 0);
    ASSERT_EQ(setrlimit(RLIMIT_NOFILE, &before), 0);
}

TEST(StreamSocket, WaitsForAConnectionInSlices) {
    const BusyService service;
    const StreamSocket socket;
    EXPECT_EQ(socket.connect("127.0.0.1", 34572, slice), std::nullopt);
    EXPECT_EQ(socket.waitConnected(slice), std::nullopt);
    service.makeRoom();
    std::optional<int> rc;
    while (!rc) {
        rc = socket.waitConnected(slice);  // the kernel asks the service again after a second
    }
    EXPECT_EQ(rc, 0);
}

TEST(StreamSocket, LearnsThatItsConnectionWasRefused) {
    std::optional<BusyService> service{std::in_place};
    const StreamSocket socket;
    ASSERT_EQ(socket.connect("127.0.0.1", 34572, slice), std::nullopt);
    service.reset();
    std::optional<int> rc;
    while (!rc) {
        rc = socket.waitConnected(slice);
    }
    EXPECT_EQ(rc, -1);
}

TEST(DeferCancellation, HoldsACancelBackWhileItLives) {
    struct Progress {
        bool inside = false;
        int stateBehind = PTHREAD_CANCEL_DISABLE;
    };
    Progress progress;
    const auto run = [](void* argument) -> void* {
        auto& reached = *static_cast<Progress*>(argument);
        {
            const DeferCancellation deferred;
            pthread_cancel(pthread_self());
            pthread_testcancel();
            reached.inside = true;
        }
        pthread_setcancelstate(PTHREAD_CANCEL_DISABLE, &reached.stateBehind);
        return nullptr;
    };
    pthread_t thread{};
    ASSERT_EQ(pthread_create(&thread, nullptr, run, &progress), 0);
    ASSERT_EQ(pthread_join(thread, nullptr), 0);
    EXPECT_TRUE(progress.inside);
    EXPECT_EQ(progress.stateBehind, PTHREAD_CANCEL_ENABLE);
}

}  // namespace
