#include "support/answering_service.h"

#include <poll.h>
#include <sys/eventfd.h>
#include <sys/socket.h>

#include <array>
#include <chrono>
#include <utility>
#include <vector>

#include "support/documents.h"
#include "support/whole_request.h"

namespace raid::test {

AnsweringService::AnsweringService(const Answers& answers)
    : configuration(answer(answers.configuration)),
      events(answer(answers.events)),
      newest(answer(newestEventDocument(answers.newestEvent))),
      listener(Socket::listening()),
      wakeUp(Socket::event()),
      server([this](const std::stop_token& stop) { serve(stop); }) {}

AnsweringService::~AnsweringService() {
    server.request_stop();
    eventfd_write(wakeUp.get(), 1);
    server.join();
}

bool AnsweringService::keepsOnly(int connections) const {
    const auto end = std::chrono::steady_clock::now() + std::chrono::minutes(1);
    while (open != connections && std::chrono::steady_clock::now() < end) {
        std::this_thread::yield();
    }
    return open == connections;
}

void AnsweringService::serve(const std::stop_token& stop) {
    constexpr int forever = -1;
    while (!stop.stop_requested()) {
        std::vector<pollfd> waiting{{.fd = wakeUp.get(), .events = POLLIN, .revents = 0},
                                    {.fd = listener.get(), .events = POLLIN, .revents = 0}};
        for (const Client& client : clients) {
            waiting.push_back({.fd = client.socket.get(), .events = POLLIN, .revents = 0});
        }
        if (poll(waiting.data(), waiting.size(), forever) < 0) {
            continue;
        }
        auto entry = waiting.begin() + 2;
        open -= static_cast<int>(std::erase_if(
            clients, [&](Client& client) { return (entry++)->revents != 0 && !receive(client); }));
        if (waiting[1].revents != 0) {
            accept();
        }
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
    if (isWholeRequest(client.request)) {
        // A client that is gone is noticed by the next receive.
        const std::string& text = answerTo(client.request);
        send(client.socket.get(), text.data(), text.size(), MSG_NOSIGNAL);
        shutdown(client.socket.get(), SHUT_WR);
    }
    return true;
}

const std::string& AnsweringService::answerTo(const std::string& request) const {
    if (request.find("?getConfig ") != std::string::npos) {
        return configuration;
    }
    return request.find("<m:getNewestEvent ") != std::string::npos ? newest : events;
}

}  // namespace raid::test
