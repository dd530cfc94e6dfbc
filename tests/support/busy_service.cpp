#include "support/busy_service.h"

#include <sys/socket.h>

namespace raid::test {

namespace {

// The one place in a queue of no length is taken by the first connection.
Socket listeningWithoutQueue() {
    Socket socket = Socket::listening();
    throwIfNegative(listen(socket.get(), 0), "shorten the queue");
    return socket;
}

}  // namespace

BusyService::BusyService() : listener(listeningWithoutQueue()), filling(Socket::connected()) {}

void BusyService::makeRoom() const {
    throwIfNegative(listen(listener.get(), SOMAXCONN), "lengthen the queue");
}

Socket BusyService::accept() const {
    const int client = accept4(listener.get(), nullptr, nullptr, SOCK_CLOEXEC);
    throwIfNegative(client, "accept a connection");
    return Socket(client);
}

}  // namespace raid::test
