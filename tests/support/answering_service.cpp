#include "support/answering_service.h"

#include <poll.h>
#include <sys/eventfd.h>
#include <sys/socket.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <utility>
#include <vector>

#include "support/documents.h"

namespace raid::test {

namespace {

using std::chrono::milliseconds;

Socket makeWakeUp() {
    const int descriptor = eventfd(0, EFD_CLOEXEC);
    throwIfNegative(descriptor, "create an event descriptor");
    return Socket(descriptor);
}

bool isWhole(const std::string& request) {
    return request.ends_with("\r\n\r\n") || request.ends_with("</env:Envelope>");
}

bool waits(const std::string& request) {
    return request.find("<m:waitNextEvent") != std::string::npos;
}

}  // namespace

AnsweringService::AnsweringService(Answers given)
    : answers(std::move(given)),
      cannedConfiguration(answer(answers.configuration)),
      cannedEvents(answer(answers.events)),
      cannedNewest(answer(newestEventDocument(answers.newestEvent))),
      listener(Socket::listening()),
      wakeUp(makeWakeUp()),
      server([this](const std::stop_token& stop) { serve(stop); }) {}

AnsweringService::~AnsweringService() {
    server.request_stop();
    eventfd_write(wakeUp.get(), 1);
    server.join();
}

bool AnsweringService::keepsOnly(int connections) const {
    const auto end = Clock::now() + std::chrono::minutes(1);
    while (open != connections && Clock::now() < end) {
        std::this_thread::yield();
    }
    return open == connections;
}

void AnsweringService::serve(const std::stop_token& stop) {
    while (!stop.stop_requested()) {
        std::vector<pollfd> waiting{{.fd = wakeUp.get(), .events = POLLIN, .revents = 0},
                                    {.fd = listener.get(), .events = POLLIN, .revents = 0}};
        for (const Client& client : clients) {
            waiting.push_back({.fd = client.socket.get(), .events = POLLIN, .revents = 0});
        }
        if (poll(waiting.data(), waiting.size(), millisecondsToNextAnswer()) < 0) {
            continue;
        }
        auto entry = waiting.begin() + 2;
        open -= static_cast<int>(std::erase_if(
            clients, [&](Client& client) { return (entry++)->revents != 0 && !receive(client); }));
        if (waiting[1].revents != 0) {
            accept();
        }
        answerDue();
    }
}

void AnsweringService::accept() {
    Socket client(accept4(listener.get(), nullptr, nullptr, SOCK_CLOEXEC));
    if (client.get() >= 0) {
        clients.push_back({.socket = std::move(client)});
        ++open;
    }
}

bool AnsweringService::receive(Client& client) const {
    std::array<char, 4096> buffer{};
    const ssize_t count = recv(client.socket.get(), buffer.data(), buffer.size(), 0);
    if (count <= 0) {
        return false;
    }
    client.request.append(buffer.data(), static_cast<std::size_t>(count));
    if (!client.isRead && isWhole(client.request)) {
        client.isRead = true;
        client.due = Clock::now();
        if (answers.thinking && waits(client.request)) {
            client.due += answers.thinking();
        }
    }
    return true;
}

void AnsweringService::answerDue() {
    for (Client& client : clients) {
        if (client.isRead && !client.isAnswered && client.due <= Clock::now()) {
            client.isAnswered = true;
            // A client that is gone is noticed by the next receive.
            const std::string& text = answerTo(client.request);
            send(client.socket.get(), text.data(), text.size(), MSG_NOSIGNAL);
            shutdown(client.socket.get(), SHUT_WR);
        }
    }
}

const std::string& AnsweringService::answerTo(const std::string& request) const {
    if (request.find("?getConfig ") != std::string::npos) {
        return cannedConfiguration;
    }
    return request.find("<m:getNewestEvent ") != std::string::npos ? cannedNewest : cannedEvents;
}

int AnsweringService::millisecondsToNextAnswer() const {
    constexpr int forever = -1;
    int wait = forever;
    for (const Client& client : clients) {
        if (client.isRead && !client.isAnswered) {
            const auto left = std::chrono::ceil<milliseconds>(client.due - Clock::now()).count();
            const int bounded = static_cast<int>(std::max<decltype(left)>(left, 0));
            wait = wait == forever ? bounded : std::min(wait, bounded);
        }
    }
    return wait;
}

}  // namespace raid::test
