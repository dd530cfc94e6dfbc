#pragma once

#include <atomic>
#include <chrono>
#include <functional>
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
    // How long it thinks before it answers a request that waits for an event; not at all without.
    std::function<std::chrono::milliseconds()> thinking = {};
};

// A service on 127.0.0.1:34572 that answers every request of the library, for as long as it lives.
class AnsweringService {
public:
    explicit AnsweringService(Answers given);
    AnsweringService(const AnsweringService&) = delete;
    AnsweringService& operator=(const AnsweringService&) = delete;
    ~AnsweringService();

    // Waits until the client has closed all its connections but this many; false when it does not
    // within a minute.
    [[nodiscard]] bool keepsOnly(int connections) const;

private:
    using Clock = std::chrono::steady_clock;

    struct Client {
        Socket socket;
        std::string request = {};
        bool isRead = false;
        bool isAnswered = false;
        Clock::time_point due = {};
    };

    void serve(const std::stop_token& stop);
    void accept();
    // False once the client has closed its end.
    [[nodiscard]] bool receive(Client& client) const;
    void answerDue();
    [[nodiscard]] const std::string& answerTo(const std::string& request) const;
    [[nodiscard]] int millisecondsToNextAnswer() const;

    const Answers answers;
    const std::string cannedConfiguration;
    const std::string cannedEvents;
    const std::string cannedNewest;
    Socket listener;
    Socket wakeUp;
    std::list<Client> clients;
    std::atomic<int> open{0};
    std::jthread server;  // the last member: it uses all the others
};

}  // namespace raid::test
