#pragma once

#include <sys/types.h>

#include <string_view>

#include "support/socket.h"

namespace raidinfo::test {

// "raidinfo watch" on a terminal that nobody reads but this. It is killed when it still runs at the
// end.
class UnreadTerminal {
public:
    UnreadTerminal();
    UnreadTerminal(const UnreadTerminal&) = delete;
    UnreadTerminal& operator=(const UnreadTerminal&) = delete;
    ~UnreadTerminal();

    // Reads until the text has come.
    void waitFor(std::string_view text);
    // Leaves room for less than a picture.
    void fill();
    // Gives it one size after the other, each of which is worth a picture.
    void resizeUntilFull() const;
    // The status that the program ends with within a minute; -1 if it does not.
    int interrupted();

private:
    [[nodiscard]] bool takesSomething() const;

    pid_t process = -1;
    raid::test::Socket master{-1};
    raid::test::Socket terminal{-1};  // as the program has it
};

}  // namespace raidinfo::test
