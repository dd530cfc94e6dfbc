#include "system/cancellable.h"

#include <poll.h>
#include <sys/eventfd.h>
#include <sys/signalfd.h>

#include <array>
#include <csignal>
#include <cstdint>
#include <cstdlib>
#include <exception>
#include <thread>

#include "exit_status.h"

namespace raidinfo {
namespace {

/// Interrupts the worker's system calls; its handler does nothing.
constexpr int wakeSignal = SIGUSR1;

int openSignals() {
    struct sigaction ignore = {};
    ignore.sa_handler = [](int) {};
    sigaction(wakeSignal, &ignore, nullptr);
    sigset_t set;
    sigemptyset(&set);
    sigaddset(&set, SIGINT);
    sigaddset(&set, SIGTERM);
    pthread_sigmask(SIG_BLOCK, &set, nullptr);
    return signalfd(-1, &set, SFD_CLOEXEC);
}

int milliseconds(std::optional<std::chrono::milliseconds> limit) {
    return limit ? static_cast<int>(limit->count()) : -1;
}

struct Readiness {
    bool signalled;
    bool finished;
};

Readiness waitFor(const Descriptor& signals, const Descriptor& finished, int timeout) {
    std::array<pollfd, 2> watched{{{signals.get(), POLLIN, 0}, {finished.get(), POLLIN, 0}}};
    if (poll(watched.data(), watched.size(), timeout) <= 0) {
        return {false, false};
    }
    return {watched[0].revents != 0, watched[1].revents != 0};
}

int takeSignal(const Descriptor& signals) {
    signalfd_siginfo info{};
    const auto size = ::read(signals.get(), &info, sizeof info);
    return size == sizeof info ? static_cast<int>(info.ssi_signo) : SIGINT;
}

}  // namespace

void wake(pthread_t thread) { pthread_kill(thread, wakeSignal); }

CancellableRun::CancellableRun()
    : signals{openSignals(), "cannot watch for signals"},
      finished{eventfd(0, EFD_CLOEXEC), "cannot make an event descriptor"} {}

Ending CancellableRun::run(const std::function<void(std::stop_token)>& work,
                           const std::function<void()>& cancel,
                           std::optional<std::chrono::milliseconds> limit) {
    std::exception_ptr thrown;
    std::jthread worker{[this, &work, &thrown](const std::stop_token& stop) {
        try {
            work(stop);
        } catch (...) {
            thrown = std::current_exception();
        }
        eventfd_write(finished.get(), 1);
    }};
    const Readiness first = waitFor(signals, finished, milliseconds(limit));
    Ending ending{.timedOut = !first.finished && !first.signalled};
    if (first.signalled) {
        ending.signal = takeSignal(signals);
    }
    worker.request_stop();
    for (Readiness now = first; !now.finished;) {
        cancel();
        wake(worker.native_handle());
        now = waitFor(signals, finished, static_cast<int>(cancelInterval.count()));
        if (now.signalled) {
            std::_Exit(signalExitBase + takeSignal(signals));
        }
    }
    worker.join();
    eventfd_t count = 0;
    eventfd_read(finished.get(), &count);
    if (thrown && !ending.signal && !ending.timedOut) {
        std::rethrow_exception(thrown);
    }
    return ending;
}

}  // namespace raidinfo
