#pragma once

#include <sys/types.h>

#include <string>

#include "support/socket.h"

namespace completion::test {

// An interactive bash at a terminal of its own that knows a completion.
class Terminal {
public:
    // The completion that a program prints of itself, known under its name.
    explicit Terminal(const std::string& program);
    ~Terminal();
    Terminal(const Terminal&) = delete;
    Terminal& operator=(const Terminal&) = delete;

    // What stands on the command line when a text and then the tabulator key were typed.
    [[nodiscard]] std::string completed(const std::string& text);

private:
    // What is shown up to a text, or until a minute is over.
    std::string readUntil(const std::string& text);

    raid::test::Socket keyboard{-1};
    pid_t bash = -1;
};

}  // namespace completion::test
