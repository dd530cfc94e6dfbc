// A service that closes and resets the connection between the connect and the send. This program
// has a send() of its own, which the library calls in place of the system's.

#include <gtest/gtest.h>
#include <poll.h>
#include <sys/socket.h>

#include <csignal>
#include <functional>

#include "exchanged.h"
#include "support/files.h"
#include "support/fresh_library.h"
#include "support/socket.h"

namespace {

std::function<void(int descriptor)> beforeSend;

}  // namespace

extern "C" ssize_t send(int descriptor, const void* bytes, std::size_t size, int flags) {
    if (beforeSend) {
        beforeSend(descriptor);
    }
    return sendto(descriptor, bytes, size, flags, nullptr, 0);
}

namespace {

using namespace raid::test;

void closeAndReset(const Socket& listener) {
    const Socket service(accept4(listener.get(), nullptr, nullptr, SOCK_CLOEXEC));
    throwIfNegative(service.get(), "accept the library's connection");
    throwIfNegative(shutdown(service.get(), SHUT_WR), "close one direction");
    const linger discard{.l_onoff = 1, .l_linger = 0};
    throwIfNegative(setsockopt(service.get(), SOL_SOCKET, SO_LINGER, &discard, sizeof discard),
                    "arrange for a reset");
}

void waitForError(int descriptor) {
    pollfd entry{.fd = descriptor, .events = 0, .revents = 0};
    while ((entry.revents & POLLERR) == 0) {
        throwIfNegative(poll(&entry, 1, -1), "wait for the reset");
    }
}

class ExchangeReset : public FreshLibrary {
protected:
    ~ExchangeReset() override { beforeSend = nullptr; }
};

TEST_F(ExchangeReset, BeforeTheRequestRaisesNoSignalInTheHost) {
    ASSERT_EQ(std::signal(SIGPIPE, SIG_DFL), SIG_DFL);
    writeLogLevel(8);
    const Socket listener = Socket::listening();
    beforeSend = [&](int descriptor) {
        closeAndReset(listener);
        waitForError(descriptor);
    };
    testing::internal::CaptureStdout();
    EXPECT_EQ(exchanged(), std::nullopt);
    EXPECT_EQ(testing::internal::GetCapturedStdout(), "sent size -1, FD isset 1\n");
    EXPECT_NE(readLog().find("Connect rc=0\nSend size=-1\n"), std::string::npos);
}

}  // namespace
