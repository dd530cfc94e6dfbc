#pragma once

#include "support/socket.h"

namespace raid::test {

// A service that hangs: its queue is full, so that the next connection does not come about.
class BusyService {
public:
    BusyService();

    // From now on there is room in the queue, for a connection that asks again, too.
    void makeRoom() const;

    [[nodiscard]] Socket accept() const;

private:
    Socket listener;
    Socket filling;
};

}  // namespace raid::test
