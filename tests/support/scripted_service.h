#pragma once

#include <condition_variable>
#include <cstddef>
#include <mutex>
#include <stop_token>
#include <string>
#include <string_view>
#include <thread>
#include <utility>
#include <vector>

#include "support/documents.h"
#include "support/gate.h"
#include "support/socket.h"

namespace raid::test {

// A part of an answer, sent on its own: it leaves after the client has taken the part before it
// from its socket, so that one receive of the client meets one piece.
struct Piece {
    Piece(std::string text, Gate* gate = nullptr) : bytes(std::move(text)), before(gate) {}
    Piece(const char* text, Gate* gate = nullptr) : bytes(text), before(gate) {}

    std::string bytes;
    Gate* before;  // when given, the piece is sent once this gate is open
};

enum class End {
    close,
    reset,
    hold  // open until the client closes, or the service ends
};

// What the service does with one connection.
struct Connection {
    bool readsRequest = true;
    std::vector<Piece> pieces = {};
    Gate* beforeEnd = nullptr;
    End end = End::close;
};

// Reads the request, answers with the body, closes.
[[nodiscard]] Connection answering(std::string_view body);

enum class Stage { awaited, accepted, requestRead, answered, ended };

// A service on 127.0.0.1:34572 that plays one script line per connection, in the order in which
// they come; connections are served side by side. It listens when the constructor returns. When it
// ends, a connection nobody scripted and a script line nobody connected to are test failures.
class ScriptedService {
public:
    explicit ScriptedService(std::vector<Connection> connections);
    ScriptedService(const ScriptedService&) = delete;
    ScriptedService& operator=(const ScriptedService&) = delete;
    ~ScriptedService();

    // Both fail the test by an exception when the connection does not get there within a minute.
    void waitFor(std::size_t connection, Stage stage) const;
    // The exact bytes received; waits until the request has been read.
    [[nodiscard]] std::string request(std::size_t connection) const;

    [[nodiscard]] std::size_t connectionCount() const;

private:
    struct Record {
        Stage stage = Stage::awaited;
        std::string request;
    };

    void acceptConnections(const std::stop_token& stop);
    void serve(std::size_t index, Socket client, const std::stop_token& stop);
    void readRequest(std::size_t index, const Socket& client);
    bool sendPieces(const Connection& connection, const Socket& client,
                    const std::stop_token& stop);
    void finish(const Connection& connection, const Socket& client, const std::stop_token& stop);
    // False when the service ends and nothing is left to read.
    [[nodiscard]] bool waitReadable(const Socket& socket) const;
    void reach(std::size_t index, Stage stage);

    const std::vector<Connection> script;
    Socket listener;
    Socket wakeUp;  // readable once the service ends
    mutable std::mutex mutex;
    mutable std::condition_variable progress;
    std::vector<Record> records;
    std::size_t accepted = 0;
    std::jthread acceptor;  // the last member: it uses all the others
};

}  // namespace raid::test
