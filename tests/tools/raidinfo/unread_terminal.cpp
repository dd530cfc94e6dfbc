#include "unread_terminal.h"

#include <fcntl.h>
#include <poll.h>
#include <pty.h>
#include <sys/ioctl.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <chrono>
#include <csignal>
#include <cstdlib>
#include <string>
#include <thread>

namespace raidinfo::test {
namespace {

using raid::test::Socket;
using raid::test::throwIfNegative;

winsize sizeOf(unsigned short columns) {
    winsize size{};
    size.ws_row = 60;
    size.ws_col = columns;
    return size;
}

std::string readFrom(const Socket& master) {
    std::array<char, 512> bytes{};
    const ssize_t count = read(master.get(), bytes.data(), bytes.size());
    throwIfNegative(count, "read from a terminal");
    return {bytes.data(), static_cast<std::size_t>(count)};
}

}  // namespace

UnreadTerminal::UnreadTerminal() {
    const winsize size = sizeOf(100);
    int number = -1;
    process = forkpty(&number, nullptr, nullptr, &size);
    if (process == 0) {
        execl("/usr/bin/env", "env", "TERM=xterm", RAIDINFO_PROGRAM, "watch", "--interval", "3600",
              nullptr);
        _exit(EXIT_FAILURE);
    }
    master = Socket{number};
    std::array<char, 64> name{};
    throwIfNegative(-ptsname_r(number, name.data(), name.size()), "name a terminal");
    terminal = Socket{open(name.data(), O_WRONLY | O_NONBLOCK | O_NOCTTY | O_CLOEXEC)};
    throwIfNegative(terminal.get(), "open a terminal");
}

UnreadTerminal::~UnreadTerminal() {
    if (process > 0) {
        kill(process, SIGKILL);
        waitpid(process, nullptr, 0);
    }
}

void UnreadTerminal::waitFor(std::string_view text) {
    std::string seen;
    while (seen.find(text) == std::string::npos) {
        seen += readFrom(master);
    }
}

void UnreadTerminal::fill() {
    while (write(terminal.get(), "x", 1) > 0) {
    }
    while (!takesSomething()) {
        static_cast<void>(readFrom(master));
    }
}

void UnreadTerminal::resizeUntilFull() const {
    for (unsigned short columns = 100; takesSomething(); columns = columns == 100 ? 101 : 100) {
        const winsize size = sizeOf(columns);
        ioctl(master.get(), TIOCSWINSZ, &size);
        std::this_thread::yield();
    }
}

int UnreadTerminal::interrupted() {
    kill(process, SIGINT);
    const auto end = std::chrono::steady_clock::now() + std::chrono::minutes{1};
    int status = 0;
    while (waitpid(process, &status, WNOHANG) == 0) {
        if (std::chrono::steady_clock::now() > end) {
            return -1;
        }
        std::this_thread::yield();
    }
    process = -1;
    return WEXITSTATUS(status);
}

bool UnreadTerminal::takesSomething() const {
    pollfd watched{terminal.get(), POLLOUT, 0};
    return poll(&watched, 1, 0) > 0;
}

}  // namespace raidinfo::test
