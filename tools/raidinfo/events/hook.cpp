#include "events/hook.h"

#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <csignal>
#include <system_error>

#include "system/memory_file.h"

namespace raidinfo {
namespace {

/// What a child starts with: this input, no signal blocked that this program blocks, and a process
/// group of its own, so that Ctrl-C is this program's to answer and reaches all that the shell has
/// started.
class Beginnings {
public:
    explicit Beginnings(const MemoryFile& input) {
        posix_spawn_file_actions_init(&files);
        posix_spawn_file_actions_adddup2(&files, input.descriptor(), STDIN_FILENO);
        // The library's lines are not for the hook's output either.
        posix_spawn_file_actions_adddup2(&files, STDERR_FILENO, STDOUT_FILENO);
        posix_spawnattr_init(&attributes);
        sigset_t none;
        sigemptyset(&none);
        posix_spawnattr_setsigmask(&attributes, &none);
        posix_spawnattr_setpgroup(&attributes, 0);
        posix_spawnattr_setflags(&attributes, POSIX_SPAWN_SETSIGMASK | POSIX_SPAWN_SETPGROUP);
    }
    Beginnings(const Beginnings&) = delete;
    Beginnings& operator=(const Beginnings&) = delete;
    ~Beginnings() {
        posix_spawn_file_actions_destroy(&files);
        posix_spawnattr_destroy(&attributes);
    }

    /// The started shell; an error number if there is none.
    [[nodiscard]] int start(std::string command, pid_t& child) const {
        std::string shell = "sh";
        std::string option = "-c";
        const std::array<char*, 4> arguments{shell.data(), option.data(), command.data(), nullptr};
        return posix_spawn(&child, "/bin/sh", &files, &attributes, arguments.data(), environ);
    }

private:
    posix_spawn_file_actions_t files{};
    posix_spawnattr_t attributes{};
};

/// A supervisor may have left it ignored; then nobody learns how a child has ended.
void noticeEndsOfChildren() {
    struct sigaction usual = {};
    usual.sa_handler = SIG_DFL;
    sigaction(SIGCHLD, &usual, nullptr);
}

int endOf(pid_t child, const std::stop_token& stop) {
    {
        const std::stop_callback terminate{stop, [child] { kill(-child, SIGTERM); }};
        // Its number stays its own until it is waited for below.
        siginfo_t information{};
        while (waitid(P_PID, static_cast<id_t>(child), &information, WEXITED | WNOWAIT) < 0 &&
               errno == EINTR) {
        }
    }
    int status = 0;
    while (waitpid(child, &status, 0) < 0 && errno == EINTR) {
    }
    return status;
}

}  // namespace

std::string runHook(const std::string& command, std::string_view input,
                    const std::stop_token& stop) {
    const MemoryFile file{input};
    noticeEndsOfChildren();
    pid_t child = -1;
    if (const int error = Beginnings{file}.start(command, child); error != 0) {
        return "cannot be run: " + std::generic_category().message(error);
    }
    const int status = endOf(child, stop);
    if (WIFSIGNALED(status)) {
        return "was ended by signal " + std::to_string(WTERMSIG(status));
    }
    return WEXITSTATUS(status) == 0 ? ""
                                    : "ended with status " + std::to_string(WEXITSTATUS(status));
}

}  // namespace raidinfo
