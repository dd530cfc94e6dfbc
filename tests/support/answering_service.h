#pragma once

#include <atomic>
#include <list>
#include <stop_token>
#include <string>
#include <thread>

#include "support/socket.h"

namespace raid::test {

// What a service says, again and again.
struct Answers {
    std::string configuration;
    std::string events;
    std::string newestEvent = {};
};

// A service on 127.0.0.1:34572 that answers every request of the library, for as long as it lives.
class AnsweringService {
public:
    explicit AnsweringService(const Answers& answers);
    AnsweringService(const AnsweringService&) = delete;
    AnsweringService& operator=(const AnsweringService&) = delete;
    ~AnsweringService();

    // Waits until the client has closed all its connections but this many; false when it does not
    // within a minute.
    [[nodiscard]] bool keepsOnly(int connections) const;

private:
    struct Client {
        Socket socket;
        std::string request = {};
    };

    void serve(const std::stop_token& stop);
    void accept();
    // False once the client has closed its end.
    [[nodiscard]] bool receive(Client& client) const;
    [[nodiscard]] const std::string& answerTo(const std::string& request) const;

    const std::string configuration;
    const std::string events;
    const std::string newest;
    Socket listener;
    Socket wakeUp;
    std::list<Client> clients;
    std::atomic<int> open{0};
    std::jthread server;  // the last member: it uses all the others
};

}  // namespace raid::test
