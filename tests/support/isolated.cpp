#include <unistd.h>

#include <exception>
#include <iostream>

#include "support/network_isolation.h"
#include "support/socket.h"

// Runs a command as the tests run: the service's port is its own.
int main(int argc, char** argv) {
    if (argc < 2) {
        std::cerr << "usage: isolated <command> [<argument>...]\n";
        return 64;
    }
    try {
        raid::test::isolateNetwork();
        raid::test::throwIfNegative(execvp(argv[1], argv + 1), std::string("run ") + argv[1]);
    } catch (const std::exception& error) {
        std::cerr << error.what() << '\n';
    }
    return 1;
}
