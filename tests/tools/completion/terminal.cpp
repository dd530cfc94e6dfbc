#include "terminal.h"

#include <poll.h>
#include <pty.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>
#include <stdexcept>

#include "support/files.h"

namespace completion::test {

namespace {

constexpr int patienceMilliseconds = 60'000;

// Neither is typed by a test. The one asks what stands on the line, the other empties it.
constexpr char showLine = '\x14';
constexpr char killLine = '\x15';

}  // namespace

Terminal::Terminal(const std::string& program) {
    raid::test::writeFile("rc", "source <(" + program +
                                    " completion)\n"
                                    "bind 'set enable-bracketed-paste off'\n"
                                    "bind -x '\"\\C-t\": printf \"<%s>\\n\" \"$READLINE_LINE\"'\n"
                                    "PS1='ready: '\n");
    int terminal = -1;
    bash = ::forkpty(&terminal, nullptr, nullptr, nullptr);
    if (bash < 0)
        throw std::runtime_error("cannot make a terminal");
    if (bash == 0) {
        ::setenv("TERM", "dumb", 1);
        ::setenv("INPUTRC", "/dev/null", 1);
        ::setenv("HISTFILE", "", 1);
        ::execl("/bin/bash", "bash", "--noprofile", "--rcfile", "rc", "-i", nullptr);
        ::_exit(127);
    }
    keyboard = raid::test::Socket(terminal);
    readUntil("ready: ");
}

Terminal::~Terminal() {
    if (bash > 0) {
        ::kill(bash, SIGKILL);
        ::waitpid(bash, nullptr, 0);
    }
}

std::string Terminal::completed(const std::string& text) {
    const std::string keys = killLine + text + '\t' + showLine;
    raid::test::throwIfNegative(::write(keyboard.get(), keys.data(), keys.size()), "type");
    const std::string shown = readUntil(">\r\n");
    const auto end = shown.rfind('>');
    const auto start = shown.rfind("\n<");
    return start == std::string::npos ? shown : shown.substr(start + 2, end - start - 2);
}

std::string Terminal::readUntil(const std::string& text) {
    std::string shown;
    pollfd waited{keyboard.get(), POLLIN, 0};
    while (shown.find(text) == std::string::npos) {
        char byte = 0;
        if (::poll(&waited, 1, patienceMilliseconds) != 1 ||
            ::read(keyboard.get(), &byte, 1) != 1) {
            throw std::runtime_error("the terminal shows no \"" + text + "\" but: " + shown);
        }
        shown += byte;
    }
    return shown;
}

}  // namespace completion::test
