#include "program.h"

#include <fcntl.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <csignal>
#include <filesystem>
#include <system_error>
#include <utility>

namespace raidsim::test {

namespace {

using raid::test::Socket;
using raid::test::throwIfNegative;

std::pair<Socket, Socket> pipeEnds() {
    std::array<int, 2> ends{};
    throwIfNegative(::pipe2(ends.data(), O_CLOEXEC), "make a pipe");
    return {Socket(ends[0]), Socket(ends[1])};
}

class FileActions {
public:
    FileActions() { posix_spawn_file_actions_init(&actions); }
    ~FileActions() { posix_spawn_file_actions_destroy(&actions); }
    FileActions(const FileActions&) = delete;
    FileActions& operator=(const FileActions&) = delete;

    void place(const Socket& source, int target) {
        posix_spawn_file_actions_adddup2(&actions, source.get(), target);
    }
    void open(const char* path, int target) {
        posix_spawn_file_actions_addopen(&actions, target, path, O_WRONLY, 0);
    }
    void close(int target) { posix_spawn_file_actions_addclose(&actions, target); }
    [[nodiscard]] const posix_spawn_file_actions_t* get() const { return &actions; }

private:
    posix_spawn_file_actions_t actions{};
};

}  // namespace

Program::Program(const std::vector<std::string>& arguments, const Streams& streams)
    : input(-1), output(-1), errors(-1) {
    auto [inputRead, inputWrite] = pipeEnds();
    auto [outputRead, outputWrite] = pipeEnds();
    auto [errorsRead, errorsWrite] = pipeEnds();
    FileActions actions;
    actions.place(inputRead, STDIN_FILENO);
    actions.place(outputWrite, STDOUT_FILENO);
    actions.place(errorsWrite, STDERR_FILENO);
    if (streams.outputFile != nullptr)
        actions.open(streams.outputFile, STDOUT_FILENO);
    for (const int descriptor : streams.closed)
        actions.close(descriptor);

    std::vector<std::string> words{RAIDSIM_PROGRAM};
    words.insert(words.end(), arguments.begin(), arguments.end());
    std::vector<char*> argv;
    for (std::string& word : words)
        argv.push_back(word.data());
    argv.push_back(nullptr);
    const int error =
        posix_spawn(&process, RAIDSIM_PROGRAM, actions.get(), nullptr, argv.data(), environ);
    if (error != 0)
        throw std::system_error(error, std::generic_category(), "cannot start raidsim");
    input = std::move(inputWrite);
    output = std::move(outputRead);
    errors = std::move(errorsRead);
}

Program::~Program() {
    if (process > 0) {
        ::kill(process, SIGKILL);
        ::waitpid(process, nullptr, 0);
    }
}

void Program::type(const std::string& text) {
    throwIfNegative(::write(input.get(), text.data(), text.size()), "type");
}

void Program::signal(int number) const { throwIfNegative(::kill(process, number), "signal"); }

std::string Program::lineOf(const Socket& stream) {
    std::string line;
    for (char byte = 0; ::read(stream.get(), &byte, 1) == 1 && byte != '\n';)
        line += byte;
    return line;
}

std::string Program::allOf(const Socket& stream) {
    std::string text;
    for (char byte = 0; ::read(stream.get(), &byte, 1) == 1;)
        text += byte;
    return text;
}

std::string Program::fileOf(int descriptor) const {
    return std::filesystem::read_symlink("/proc/" + std::to_string(process) + "/fd/" +
                                         std::to_string(descriptor));
}

int Program::exitStatus() {
    int status = 0;
    throwIfNegative(::waitpid(std::exchange(process, -1), &status, 0), "wait for the program");
    return WIFEXITED(status) ? WEXITSTATUS(status) : -WTERMSIG(status);
}

}  // namespace raidsim::test
