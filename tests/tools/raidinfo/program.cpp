#include "program.h"

#include <fcntl.h>
#include <poll.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <csignal>
#include <stdexcept>
#include <utility>

namespace raidinfo::test {
namespace {

using raid::test::Socket;
using raid::test::throwIfNegative;

constexpr int patienceMilliseconds = 60'000;

struct Pipe {
    Socket readEnd;
    Socket writeEnd;
};

Pipe makePipe() {
    std::array<int, 2> ends{};
    throwIfNegative(pipe2(ends.data(), O_CLOEXEC), "create a pipe");
    return {Socket{ends[0]}, Socket{ends[1]}};
}

pid_t spawn(std::vector<std::string>& command, const Pipe& input, const Pipe& output,
            const Pipe& errors) {
    std::vector<char*> arguments;
    for (std::string& argument : command) {
        arguments.push_back(argument.data());
    }
    arguments.push_back(nullptr);
    posix_spawn_file_actions_t streams;
    posix_spawn_file_actions_init(&streams);
    posix_spawn_file_actions_adddup2(&streams, input.readEnd.get(), STDIN_FILENO);
    posix_spawn_file_actions_adddup2(&streams, output.writeEnd.get(), STDOUT_FILENO);
    posix_spawn_file_actions_adddup2(&streams, errors.writeEnd.get(), STDERR_FILENO);
    pid_t process = -1;
    const int error = posix_spawn(&process, command.front().c_str(), &streams, nullptr,
                                  arguments.data(), environ);
    posix_spawn_file_actions_destroy(&streams);
    if (error != 0) {
        throw std::runtime_error{"cannot start " + command.front()};
    }
    return process;
}

// True once the stream has ended.
bool readInto(std::string& text, Socket& stream) {
    std::array<char, 4096> bytes{};
    const ssize_t count = read(stream.get(), bytes.data(), bytes.size());
    throwIfNegative(count, "read from a program");
    text.append(bytes.data(), static_cast<std::size_t>(count));
    return count == 0;
}

int occurrences(std::string_view text, std::string_view output) {
    int count = 0;
    for (std::size_t place = output.find(text); place != std::string_view::npos;
         place = output.find(text, place + text.size())) {
        ++count;
    }
    return count;
}

}  // namespace

Program::Program(std::vector<std::string> command) : input{-1}, output{-1}, errors{-1} {
    Pipe toProgram = makePipe();
    Pipe fromProgram = makePipe();
    Pipe errorsOfProgram = makePipe();
    process = spawn(command, toProgram, fromProgram, errorsOfProgram);
    input = std::move(toProgram.writeEnd);
    output = std::move(fromProgram.readEnd);
    errors = std::move(errorsOfProgram.readEnd);
}

Program::~Program() {
    if (process > 0) {
        kill(process, SIGKILL);
        waitpid(process, nullptr, 0);
    }
}

void Program::send(std::string_view text) {
    throwIfNegative(write(input.get(), text.data(), text.size()), "write to a program");
}

void Program::endInput() noexcept { input.close(); }

void Program::signal(int number) const { throwIfNegative(kill(process, number), "signal"); }

std::string Program::waitForOutput(std::string_view text, int times) {
    while (occurrences(text, result.output) < times) {
        if (!readMore()) {
            throw std::runtime_error{"the program ended without the output expected; it wrote:\n" +
                                     result.output + result.errors};
        }
    }
    return result.output;
}

Result Program::finish() {
    while (readMore()) {
    }
    int status = 0;
    throwIfNegative(waitpid(std::exchange(process, -1), &status, 0), "wait for a program");
    result.status = WIFEXITED(status) ? WEXITSTATUS(status) : 128 + WTERMSIG(status);
    return result;
}

bool Program::readMore() {
    // A descriptor of -1, a stream that has ended, is passed over.
    std::array<pollfd, 2> streams{{{output.get(), POLLIN, 0}, {errors.get(), POLLIN, 0}}};
    if (output.get() < 0 && errors.get() < 0) {
        return false;
    }
    const int ready = poll(streams.data(), streams.size(), patienceMilliseconds);
    throwIfNegative(ready, "wait for a program");
    if (ready == 0) {
        throw std::runtime_error{"the program neither went on nor ended; it wrote:\n" +
                                 result.output + result.errors};
    }
    if (streams[0].revents != 0 && readInto(result.output, output)) {
        output.close();
    }
    if (streams[1].revents != 0 && readInto(result.errors, errors)) {
        errors.close();
    }
    return true;
}

std::vector<std::string> raidinfo(std::vector<std::string> arguments) {
    arguments.insert(arguments.begin(), RAIDINFO_PROGRAM);
    return arguments;
}

Result run(std::vector<std::string> arguments) {
    return Program{raidinfo(std::move(arguments))}.finish();
}

}  // namespace raidinfo::test
