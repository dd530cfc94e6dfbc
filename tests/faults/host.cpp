#include "host.h"

#include <fcntl.h>
#include <unistd.h>

#include <chrono>
#include <cstdio>
#include <filesystem>
#include <iterator>
#include <map>
#include <string_view>
#include <thread>

#include "RAIDInstrumentation.h"
#include "agent/agent_link.h"
#include "agent/exchange.h"
#include "flat/lists.h"
#include "published_state.h"
#include "support/blocked_call.h"
#include "support/files.h"
#include "support/socket.h"

namespace raid::test {

namespace {

using raidsim::Fate;
using raidsim::FaultOutcome;
using raidsim::HostCall;

// Every exchange prints a line on standard output, where nobody wants thousands of them.
class QuietOutput {
public:
    QuietOutput() : before(dup(STDOUT_FILENO)) {
        std::fflush(stdout);
        const Socket null(open("/dev/null", O_WRONLY | O_CLOEXEC));
        dup2(null.get(), STDOUT_FILENO);
    }
    QuietOutput(const QuietOutput&) = delete;
    QuietOutput& operator=(const QuietOutput&) = delete;
    ~QuietOutput() {
        std::fflush(stdout);
        dup2(before.get(), STDOUT_FILENO);
    }

private:
    Socket before;
};

std::size_t threadsNow() {
    const std::filesystem::directory_iterator tasks("/proc/self/task");
    return static_cast<std::size_t>(std::distance(begin(tasks), end(tasks)));
}

std::vector<int> sequenceNumbers() {
    std::vector<int> numbers;
    for (int position = 0; position < getRAIDEventCount(); ++position) {
        numbers.push_back(getRAIDEventSequenceNumber(position));
    }
    return numbers;
}

void setLevel(int level) {
    configRead = 1;
    LOG_LEVEL = level;
}

// A call of a host, and what cancels it.
struct Call {
    int (*make)();
    void (*cancel)();
};

const std::map<HostCall, Call> calls{
    {HostCall::refresh,
     {[] {
          setRefreshFlag();
          return getChannelCount();
      },
      disconnectSocket}},
    {HostCall::getEvent,
     {[] {
          setRAIDEventSequenceNumber(1);
          return getEvent();
      },
      cancelGetEvent}},
    {HostCall::enableRAIDEvent, {enableRAIDEvent, disconnectSocket}},
};

}  // namespace

ThreadCount::ThreadCount() {
    // With the first one that is started the thread sanitizer starts one, too.
    pid_t first = 0;
    std::jthread([&] { first = gettid(); }).join();
    while (std::filesystem::exists("/proc/self/task/" + std::to_string(first))) {
        std::this_thread::yield();
    }
    before = threadsNow();
}

bool ThreadCount::isReachedAgain() const {
    const auto end = std::chrono::steady_clock::now() + std::chrono::seconds(10);
    while (threadsNow() != before && std::chrono::steady_clock::now() < end) {
        std::this_thread::yield();
    }
    return threadsNow() == before;
}

Host::Host(Simulator& served) : simulator(served) {
    simulator.serveMarked();
    refreshGood();
    marked = publishedConfiguration();
    markedSystem = std::make_unique<RAIDSystem>(*raidSystem);
    markedChannels = ChannelList;
    simulator.serveUnmarked();
    refreshGood();
    published = publishedConfiguration();
    markEvents();
}

void Host::refreshGood() {
    const QuietOutput quiet;
    setLevel(0);
    setRefreshFlag();
    (void)getChannelCount();
}

// A batch that lacks the first event: a fault's answer holds them all.
void Host::markEvents() {
    const QuietOutput quiet;
    setRAIDEventSequenceNumber(2);
    getEvent();
    eventsBefore = sequenceNumbers();
}

void Host::startGood(const FaultOutcome& outcome) {
    *raidSystem = *markedSystem;
    ChannelList = markedChannels;
    if (outcome.events != Fate::unsaid) {
        markEvents();
    }
}

int Host::call(const FaultOutcome& outcome, int level) {
    const QuietOutput quiet;
    std::filesystem::remove(logPath);
    setLevel(level);
    const Call& wanted = calls.at(outcome.call);
    int result = 0;
    if (outcome.cancels) {
        BlockedCall blocked(wanted.make);
        simulator.waitForStall();
        wanted.cancel();
        result = blocked.interrupt();
    } else {
        result = wanted.make();
    }
    setLevel(0);
    return result;
}

Fate Host::configuration() const {
    const bool listsKept = publishedConfiguration() == marked;
    if (raidSystem == nullptr) {
        return listsKept ? Fate::lost : Fate::unsaid;
    }
    return listsKept ? Fate::kept : Fate::replaced;
}

Fate Host::events() const {
    const auto events = sequenceNumbers();
    if (raidEvents == nullptr) {
        return events.empty() ? Fate::lost : Fate::unsaid;
    }
    return events == eventsBefore ? Fate::kept : Fate::replaced;
}

std::string Host::log() {
    // The descriptor's number is the host's, not the fault's.
    constexpr std::string_view line = "Socket handle=";
    std::string log = readLog();
    for (auto at = log.find(line); at != std::string::npos; at = log.find(line, at)) {
        at += line.size();
        log.replace(at, log.find_first_not_of("0123456789", at) - at, "#");
    }
    return log;
}

bool Host::isGoodAgain() {
    refreshGood();
    return raidSystem != nullptr && publishedConfiguration() == published;
}

}  // namespace raid::test
