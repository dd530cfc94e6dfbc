#pragma once

#include <sys/types.h>

#include <string>
#include <string_view>
#include <vector>

#include "support/socket.h"

namespace raidinfo::test {

struct Result {
    int status;  // as a shell sees it: 128 plus the signal for a killed program
    std::string output;
    std::string errors;
};

// A program that runs beside the test, with pipes for its three standard streams. It is killed when
// it still runs at the end. Waits fail the test by an exception after a minute.
class Program {
public:
    explicit Program(std::vector<std::string> command);
    Program(const Program&) = delete;
    Program& operator=(const Program&) = delete;
    ~Program();

    void send(std::string_view input);
    void endInput() noexcept;
    void signal(int number) const;
    // Returns the output so far, once it has the text in it so often.
    std::string waitForOutput(std::string_view text, int times = 1);
    Result finish();

private:
    // Reads what comes next from either stream; false at the end of both.
    bool readMore();

    pid_t process = -1;
    raid::test::Socket input;
    raid::test::Socket output;
    raid::test::Socket errors;
    Result result{-1, "", ""};
};

// The command line of raidinfo.
[[nodiscard]] std::vector<std::string> raidinfo(std::vector<std::string> arguments);

// Runs raidinfo to its end.
[[nodiscard]] Result run(std::vector<std::string> arguments);

}  // namespace raidinfo::test
