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
#include "net/client.h"
#include "net/server.h"
#include "service.h"

namespace raidsim {

// One client: a request, perhaps a wait for an event, an answer, the end.
class Session : public Client, public std::enable_shared_from_this<Session> {
public:
    // Takes the connection over, its request read, for a fault that met it.
    using HandOver = std::function<void(boost::asio::ip::tcp::socket socket, FaultDesk::Play play,
                                        std::string goodBody)>;

    Session(boost::asio::ip::tcp::socket client, Service& service, const ServerSettings& settings,
            Closed closed, HandOver handOver);

    void start() override;

    // Answers without waiting for the request.
    void refuse(const http::Refusal& refusal);

    void close() override;
    void reset() override;

private:
    enum class State { reading, waiting, answering, draining, closed };

    void read();
    void received(std::size_t count);
    void ended();
    void handle(const http::Request& request);
    bool handToFault(const http::Request& request);
    void answer(const http::Answer& answer);
    // Nothing more is sent.
    void finish();
    void limit(std::chrono::milliseconds time);
    void timedOut();

    boost::asio::ip::tcp::socket socket;
    boost::asio::steady_timer timer;
    Service& service;
    const ServerSettings settings;
    Closed onClosed;
    HandOver handOver;
    State state = State::reading;
    std::array<char, 4096> chunk{};
    std::string request;
    std::string bytes;
    std::size_t drained = 0;
    bool clientEnded = false;
    std::optional<EventLog::Ticket> ticket;
};

}  // namespace raidsim
