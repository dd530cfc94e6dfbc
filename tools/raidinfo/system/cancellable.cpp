#include "system/cancellable.h"

#include <poll.h>
#include <sys/eventfd.h>
#include <sys/signalfd.h>

#include <algorithm>
#include <array>
#include <csignal>
#include <cstdint>
#include <cstdlib>
#include <exception>
#include <thread>

#include "exit_status.h"
#include "system/terminal_guest.h"

namespace raidinfo {
namespace {

/// Interrupts the worker's system calls; its handler does nothing.
constexpr int wakeSignal = SIGUSR1;

/// Of the run that the thread works for; of none it is never requested.
thread_local std::stop_token stopOfWork;

bool isIgnored(int signal) {
    struct sigaction present = {};
    return sigaction(signal, nullptr, &present) == 0 && present.sa_handler == SIG_IGN;
}

int openSignals() {
    struct sigaction ignore = {};
    ignore.sa_handler = [](int) {};
    sigaction(wakeSignal, &ignore, nullptr);
    sigset_t set;
    sigemptyset(&set);
    sigaddset(&set, SIGINT);
    sigaddset(&set, SIGTERM);
    sigaddset(&set, SIGWINCH);
    // Whoever started the program may not want it to be ended or stopped by these: nohup, say.
    for (const int signal : {SIGHUP, SIGQUIT, SIGTSTP}) {
        if (!isIgnored(signal)) {
            sigaddset(&set, signal);
        }
    }
    pthread_sigmask(SIG_BLOCK, &set, nullptr);
    return signalfd(-1, &set, SFD_CLOEXEC);
}

int takeSignal(const Descriptor& signals) {
    signalfd_siginfo info{};
    const auto size = ::read(signals.get(), &info, sizeof info);
    return size == sizeof info ? static_cast<int>(info.ssi_signo) : SIGINT;
}

/// Stops the program as SIGTSTP does by itself; returns when it goes on.
void stopProgram() {
    leaveTerminal();
    sigset_t set;
    sigemptyset(&set);
    sigaddset(&set, SIGTSTP);
    raise(SIGTSTP);
    pthread_sigmask(SIG_UNBLOCK, &set, nullptr);
    pthread_sigmask(SIG_BLOCK, &set, nullptr);
    enterTerminal();
}

using Clock = std::chrono::steady_clock;
using Deadline = std::optional<Clock::time_point>;

int millisecondsUntil(const Deadline& deadline) {
    if (!deadline) {
        return -1;
    }
    const auto left = std::chrono::ceil<std::chrono::milliseconds>(*deadline - Clock::now());
    return std::max(0, static_cast<int>(left.count()));
}

struct Happening {
    std::optional<int> signal = std::nullopt;
    bool finished = false;
};

/// The next thing that happens before the deadline, if anything.
Happening waitFor(const Descriptor& signals, const Descriptor& finished, const Deadline& deadline) {
    while (true) {
        std::array<pollfd, 2> watched{{{signals.get(), POLLIN, 0}, {finished.get(), POLLIN, 0}}};
        const int ready = poll(watched.data(), watched.size(), millisecondsUntil(deadline));
        if (ready == 0) {
            return {};
        }
        if (ready > 0 && watched[0].revents == 0) {
            return {.finished = true};
        }
        if (ready > 0) {
            const int signal = takeSignal(signals);
            if (signal == SIGTSTP) {
                stopProgram();
            } else if (signal == SIGWINCH) {
                redrawTerminal();
            } else {
                return {signal, watched[1].revents != 0};
            }
        }
    }
}

}  // namespace

bool isCancelled() noexcept { return stopOfWork.stop_requested(); }

void wake(pthread_t thread) { pthread_kill(thread, wakeSignal); }

CancellableRun::CancellableRun()
    : signals{openSignals(), "cannot watch for signals"},
      finished{eventfd(0, EFD_CLOEXEC), "cannot make an event descriptor"} {}

std::optional<int> CancellableRun::run(const std::function<void(std::stop_token)>& work,
                                       const std::function<void()>& cancel) {
    std::exception_ptr thrown;
    std::jthread worker{[this, &work, &thrown](const std::stop_token& stop) {
        stopOfWork = stop;
        try {
            work(stop);
        } catch (...) {
            thrown = std::current_exception();
        }
        eventfd_write(finished.get(), 1);
    }};
    const Happening first = waitFor(signals, finished, std::nullopt);
    worker.request_stop();
    for (Happening now = first; !now.finished;) {
        cancel();
        wake(worker.native_handle());
        now = waitFor(signals, finished, Clock::now() + cancelInterval);
        if (now.signal) {
            abandonTerminal();
            std::_Exit(signalExitBase + *now.signal);
        }
    }
    worker.join();
    eventfd_t count = 0;
    eventfd_read(finished.get(), &count);
    if (thrown && !first.signal) {
        std::rethrow_exception(thrown);
    }
    return first.signal;
}

}  // namespace raidinfo
