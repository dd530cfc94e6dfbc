#pragma once

#include <cstdint>

#include "inventory/records.h"
#include "library/library.h"

namespace raidinfo {

/// What a wait for events came to: a batch, an answer that is malformed, or none.
struct Awaited {
    enum class Outcome : std::uint8_t { read, malformed, failed };
    Outcome outcome;
    Records events;
};

/// Waits for events in the library. There a wait that fails leaves what was read before, as if the
/// service had sent it once more; so that the two can be told apart, the library reads a batch that
/// no service sends before each wait.
class EventWait {
public:
    explicit EventWait(const Library& library);

    /// For events from this number on, or some numbers below where it is one of the largest. Ends
    /// early, and fails, when cancelGetEvent is called.
    [[nodiscard]] Awaited from(std::int64_t number);

private:
    void leaveMark() const;

    RecordReader reader;
    int (*process)(char*, int);
    void (*setNext)(int);
    int (*wait)();
    const void* const* batch;  ///< the library's: null after a malformed answer
};

}  // namespace raidinfo
