#pragma once

#include <cstddef>
#include <string>
#include <vector>

namespace raid::fuzz {

/// One thing that happens on the socket of an exchange.
struct Happening {
    enum class Kind {
        piece,      // bytes arrive, and are taken by as many receives as it takes
        silence,    // a slice of the wait passes
        signal,     // a system call is interrupted
        reset,      // the connection is reset
        disconnect  // another thread calls disconnectSocket, and the slice passes
    };

    Kind kind = Kind::piece;
    std::string bytes = {};
};

/// Replaces the socket of the next exchange by this script; when it has ended the connection is
/// closed. The linker puts these calls in the place of libc's (the target links scripted_stream).
void play(std::vector<Happening> script);

/// Whether the exchange has closed its socket.
[[nodiscard]] bool isClosed();

}  // namespace raid::fuzz
