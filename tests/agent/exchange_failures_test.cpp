// Services and systems that fail an exchange.

#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/resource.h>
#include <unistd.h>

#include <fstream>
#include <string>
#include <vector>

#include "exchanged.h"
#include "support/blocked_call.h"
#include "support/files.h"
#include "support/fresh_library.h"
#include "support/scripted_service.h"

namespace {

using namespace raid::test;

// Changes a limit of this process until the end of the scope.
class Limit {
public:
    Limit(__rlimit_resource_t limited, rlim_t value) : resource(limited) {
        throwIfNegative(getrlimit(resource, &before), "read a limit");
        const rlimit changed{.rlim_cur = value, .rlim_max = before.rlim_max};
        throwIfNegative(setrlimit(resource, &changed), "change a limit");
    }
    Limit(const Limit&) = delete;
    Limit& operator=(const Limit&) = delete;
    ~Limit() { setrlimit(resource, &before); }

private:
    __rlimit_resource_t resource;
    rlimit before{};
};

Socket nullDevice() {
    const int opened = open("/dev/null", O_RDONLY | O_CLOEXEC);
    throwIfNegative(opened, "open /dev/null");
    return Socket(opened);
}

rlim_t addressSpaceInUse() {
    rlim_t pages = 0;
    std::ifstream("/proc/self/statm") >> pages;
    return pages * static_cast<rlim_t>(sysconf(_SC_PAGESIZE));
}

class ExchangeFailures : public FreshLibrary {};

TEST_F(ExchangeFailures, YieldNullWhenNoServiceListens) { EXPECT_EQ(exchanged(), std::nullopt); }

TEST_F(ExchangeFailures, YieldNullWhenNoSocketCanBeMade) {
    const int firstFree = nullDevice().get();
    const Limit noDescriptors(RLIMIT_NOFILE, static_cast<rlim_t>(firstFree));
    EXPECT_EQ(exchanged(), std::nullopt);
}

TEST_F(ExchangeFailures, YieldNullWhenTheServiceClosesWithoutAnAnswer) {
    const ScriptedService service({Connection{}});
    EXPECT_EQ(exchanged(), std::nullopt);
}

TEST_F(ExchangeFailures, YieldNullWhenTheServiceResetsTheConnection) {
    const ScriptedService service({{.end = End::reset}});
    EXPECT_EQ(exchanged(), std::nullopt);
}

TEST_F(ExchangeFailures, YieldNullAndCloseTheSocketWhenTheBodyCannotBeAllocated) {
    const ScriptedService service(
        {{.pieces = {"Content-Length: 999999999\n\n<a>"}, .end = End::hold}});
    const Limit memory(RLIMIT_AS, addressSpaceInUse() + (rlim_t{256} << 20U));
    EXPECT_EQ(exchanged(), std::nullopt);
    service.waitFor(0, Stage::ended);
}

TEST_F(ExchangeFailures, KeepWhatCameWhenTheServiceResetsInTheMiddleOfTheBody) {
    writeLogLevel(8);
    // The empty piece is sent, and so the connection reset, once the one before it was taken.
    const ScriptedService service(
        {{.pieces = {"Content-Length: 9\n\n", "body", ""}, .end = End::reset}});
    EXPECT_EQ(exchanged(), "body");
    EXPECT_TRUE(
        readLog().ends_with("Data received 4\nData received -1\nReturn from getSOPEData\n"));
}

TEST_F(ExchangeFailures, CanBeCancelledWhenTheServiceStallsInTheMiddleOfTheBody) {
    const ScriptedService service(
        {{.pieces = {"Content-Length: 9\n\n", "body", ""}, .end = End::hold}});
    BlockedCall blocked([] { return exchanged(); });
    service.waitFor(0, Stage::answered);
    disconnectSocket();
    EXPECT_EQ(blocked.interrupt(), std::nullopt);
    service.waitFor(0, Stage::ended);  // unlike in the wait before, the socket was closed
}

TEST_F(ExchangeFailures, CanBeCancelledWhileTheServiceSendsAByteNowAndThen) {
    std::vector<Piece> drops(100'000, "b");
    drops.front().bytes = "Content-Length: 100000\n\nb";
    const ScriptedService service({{.pieces = drops, .end = End::hold}});
    BlockedCall blocked([] { return exchanged(); });
    while (!blocked.returnsWithin(std::chrono::milliseconds(1))) {
        disconnectSocket();
    }
    EXPECT_EQ(blocked.wait(), std::nullopt);
}

TEST_F(ExchangeFailures, DoNotComeFromDescriptorsAboveThoseOfADescriptorSet) {
    constexpr int most = FD_SETSIZE;
    const Limit descriptors(RLIMIT_NOFILE, 2 * most);
    std::vector<Socket> taken;
    while (taken.empty() || taken.back().get() < most) {
        taken.push_back(nullDevice());
    }
    writeLogLevel(8);
    const ScriptedService service({{.pieces = {"Content-Length: 4\n\n", "body"}}});
    EXPECT_EQ(exchanged(), "body");
    const std::string log = readLog();
    constexpr std::string_view line = "Socket handle=";
    EXPECT_GT(std::stoi(log.substr(log.find(line) + line.size())), most);
}

}  // namespace
