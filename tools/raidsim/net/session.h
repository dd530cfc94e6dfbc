#pragma once

#include <array>
#include <boost/asio/ip/tcp.hpp>
#include <boost/asio/steady_timer.hpp>
#include <chrono>
#include <cstddef>
#include <functional>
#include <memory>
#include <optional>
#include <string>

#include "http/message.h"
#include "net/server.h"
#include "service.h"

namespace raidsim {

// One client: a request, perhaps a wait for an event, an answer, the end.
class Session : public std::enable_shared_from_this<Session> {
public:
    using Closed = std::function<void(const std::shared_ptr<Session>&)>;

    Session(boost::asio::ip::tcp::socket client, Service& service, const ServerSettings& settings,
            Closed closed);

    void start();

    // Answers without waiting for the request.
    void refuse(const http::Refusal& refusal);

    // Idempotent; a wait is given up.
    void close();

private:
    enum class State { reading, waiting, answering, draining, closed };

    void read();
    void received(std::size_t count);
    void ended();
    void handle(const http::Request& request);
    void answer(const http::Answer& answer);
    void answered();
    void limit(std::chrono::milliseconds time);
    void timedOut();

    boost::asio::ip::tcp::socket socket;
    boost::asio::steady_timer timer;
    Service& service;
    const ServerSettings settings;
    Closed onClosed;
    State state = State::reading;
    std::array<char, 4096> chunk{};
    std::string request;
    std::string bytes;
    std::size_t drained = 0;
    bool clientEnded = false;
    std::optional<EventLog::Ticket> ticket;
};

}  // namespace raidsim
