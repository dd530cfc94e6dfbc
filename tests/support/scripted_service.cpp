#include "support/scripted_service.h"

#include <gtest/gtest.h>
#include <linux/sockios.h>
#include <netinet/in.h>
#include <netinet/tcp.h>
#include <poll.h>
#include <sys/eventfd.h>
#include <sys/ioctl.h>
#include <sys/socket.h>

#include <algorithm>
#include <array>
#include <bit>
#include <cerrno>
#include <chrono>
#include <cstdint>
#include <fstream>
#include <list>
#include <stdexcept>

#include "support/whole_request.h"

namespace raid::test {

namespace {

constexpr std::chrono::seconds patience{60};

in_port_t port(const Socket& socket, decltype(getpeername)* name) {
    sockaddr_in address{};
    socklen_t size = sizeof address;
    throwIfNegative(name(socket.get(), std::bit_cast<sockaddr*>(&address), &size),
                    "look up a connection's port");
    return ntohs(address.sin_port);
}

std::string hex(in_port_t port) {
    std::array<char, 5> text{};
    const auto size = std::snprintf(text.data(), text.size(), "%04X", port);
    return {text.data(), static_cast<std::size_t>(size)};
}

// Whether the client has bytes of this connection in its receive queue that it has not taken.
bool clientHasUnread(const Socket& client) {
    int unsent = 0;
    throwIfNegative(ioctl(client.get(), SIOCOUTQ, &unsent), "look at the send queue");
    if (unsent > 0) {
        return true;
    }
    const std::string local = ":" + hex(port(client, getpeername));
    const std::string remote = ":" + hex(port(client, getsockname));
    std::ifstream table("/proc/thread-self/net/tcp");
    std::string slot;
    std::string from;
    std::string to;
    std::string state;
    std::string queues;
    std::string rest;
    while (table >> slot >> from >> to >> state >> queues && std::getline(table, rest)) {
        if (from.ends_with(local) && to.ends_with(remote)) {
            return queues.substr(queues.find(':') + 1).find_first_not_of('0') != std::string::npos;
        }
    }
    return false;
}

// The kernel offers nothing to block on here.
void waitUntilTaken(const Socket& client, const std::stop_token& stop) {
    while (!stop.stop_requested() && clientHasUnread(client)) {
        std::this_thread::yield();
    }
}

bool sendAll(const Socket& client, std::string_view bytes) {
    while (!bytes.empty()) {
        const ssize_t sent = send(client.get(), bytes.data(), bytes.size(), MSG_NOSIGNAL);
        if (sent < 0) {
            return false;
        }
        bytes.remove_prefix(static_cast<std::size_t>(sent));
    }
    return true;
}

}  // namespace

Connection answering(std::string_view body) { return {.pieces = {answer(body)}}; }

ScriptedService::ScriptedService(std::vector<Connection> connections)
    : script(std::move(connections)),
      listener(Socket::listening()),
      wakeUp(Socket::event()),
      records(script.size()),
      acceptor([this](const std::stop_token& stop) { acceptConnections(stop); }) {}

ScriptedService::~ScriptedService() {
    acceptor.request_stop();
    eventfd_write(wakeUp.get(), 1);
    acceptor.join();
    EXPECT_EQ(accepted, script.size()) << "connections made, and connections scripted";
}

void ScriptedService::waitFor(std::size_t connection, Stage stage) const {
    std::unique_lock lock(mutex);
    if (!progress.wait_for(lock, patience, [&] { return records.at(connection).stage >= stage; })) {
        throw std::runtime_error("connection " + std::to_string(connection) +
                                 " of the scripted service never got as far as expected");
    }
}

std::string ScriptedService::request(std::size_t connection) const {
    waitFor(connection, Stage::requestRead);
    const std::lock_guard lock(mutex);
    return records.at(connection).request;
}

std::size_t ScriptedService::connectionCount() const {
    const std::lock_guard lock(mutex);
    return accepted;
}

void ScriptedService::acceptConnections(const std::stop_token& stop) {
    std::list<std::jthread> connections;
    while (waitReadable(listener)) {
        Socket client(accept4(listener.get(), nullptr, nullptr, SOCK_CLOEXEC));
        if (client.get() < 0) {
            continue;
        }
        std::size_t index = 0;
        {
            const std::lock_guard lock(mutex);
            index = accepted++;
        }
        if (index < script.size()) {
            connections.emplace_back([this, index, stop, socket = std::move(client)]() mutable {
                serve(index, std::move(socket), stop);
            });
        }
    }
}

void ScriptedService::serve(std::size_t index, Socket client, const std::stop_token& stop) {
    const Connection& connection = script[index];
    const int on = 1;
    setsockopt(client.get(), IPPROTO_TCP, TCP_NODELAY, &on, sizeof on);
    reach(index, Stage::accepted);
    if (connection.readsRequest) {
        readRequest(index, client);
    }
    reach(index, Stage::requestRead);
    if (sendPieces(connection, client, stop)) {
        reach(index, Stage::answered);
        finish(connection, client, stop);
    }
    client.close();
    reach(index, Stage::ended);
}

void ScriptedService::readRequest(std::size_t index, const Socket& client) {
    std::string request;
    std::array<char, 4096> buffer{};
    while (!isWholeRequest(request) && waitReadable(client)) {
        const ssize_t received = recv(client.get(), buffer.data(), buffer.size(), 0);
        if (received <= 0) {
            break;
        }
        request.append(buffer.data(), static_cast<std::size_t>(received));
    }
    const std::lock_guard lock(mutex);
    records[index].request = std::move(request);
}

bool ScriptedService::sendPieces(const Connection& connection, const Socket& client,
                                 const std::stop_token& stop) {
    for (const Piece& piece : connection.pieces) {
        waitUntilTaken(client, stop);
        if ((piece.before != nullptr && !piece.before->wait(stop)) ||
            !sendAll(client, piece.bytes)) {
            return false;
        }
    }
    return true;
}

void ScriptedService::finish(const Connection& connection, const Socket& client,
                             const std::stop_token& stop) {
    if (connection.beforeEnd != nullptr) {
        connection.beforeEnd->wait(stop);
    }
    switch (connection.end) {
        case End::close:
            break;
        case End::reset: {
            const linger discard{.l_onoff = 1, .l_linger = 0};
            setsockopt(client.get(), SOL_SOCKET, SO_LINGER, &discard, sizeof discard);
            break;
        }
        case End::hold: {
            char byte = 0;
            while (waitReadable(client) && recv(client.get(), &byte, 1, 0) > 0) {
            }
            break;
        }
    }
}

bool ScriptedService::waitReadable(const Socket& socket) const {
    std::array<pollfd, 2> waiting{pollfd{.fd = socket.get(), .events = POLLIN, .revents = 0},
                                  pollfd{.fd = wakeUp.get(), .events = POLLIN, .revents = 0}};
    while (poll(waiting.data(), waiting.size(), -1) < 0 && errno == EINTR) {
    }
    return waiting[0].revents != 0;
}

void ScriptedService::reach(std::size_t index, Stage stage) {
    {
        const std::lock_guard lock(mutex);
        records[index].stage = stage;
    }
    progress.notify_all();
}

}  // namespace raid::test
