#pragma once

#include <sys/types.h>

#include <string>
#include <vector>

#include "support/socket.h"

namespace raidsim::test {

// What a program has for its standard streams in place of pipes.
struct Streams {
    const char* outputFile = nullptr;
    std::vector<int> closed{};
};

// The program raidsim as a process of its own, its three streams on pipes unless told otherwise.
class Program {
public:
    explicit Program(const std::vector<std::string>& arguments, const Streams& streams = {});
    ~Program();
    Program(const Program&) = delete;
    Program& operator=(const Program&) = delete;

    void type(const std::string& text);
    void endInput() { input.close(); }
    void signal(int number) const;

    [[nodiscard]] std::string readLine() { return lineOf(output); }
    [[nodiscard]] std::string readErrorLine() { return lineOf(errors); }
    // Everything up to the end of the program.
    [[nodiscard]] std::string readOutput() { return allOf(output); }
    [[nodiscard]] std::string readErrors() { return allOf(errors); }

    // Where one of its descriptors leads, as long as it runs.
    [[nodiscard]] std::string fileOf(int descriptor) const;

    [[nodiscard]] int exitStatus();

private:
    static std::string lineOf(const raid::test::Socket& stream);
    static std::string allOf(const raid::test::Socket& stream);

    raid::test::Socket input;
    raid::test::Socket output;
    raid::test::Socket errors;
    pid_t process = -1;
};

}  // namespace raidsim::test
