#pragma once

#include <boost/asio/io_context.hpp>
#include <boost/asio/ip/tcp.hpp>
#include <boost/asio/steady_timer.hpp>
#include <chrono>
#include <cstddef>
#include <cstdint>
#include <memory>
#include <set>

#include "bounds.h"
#include "service.h"

namespace raidsim {

class Client;

struct ServerSettings {
    std::uint16_t port = 34572;
    std::size_t clients = bounds::clients;
    std::chrono::milliseconds requestTime = bounds::requestTime;
    std::chrono::milliseconds answerTime = bounds::answerTime;
    std::chrono::milliseconds drainTime = bounds::drainTime;
};

// Accepts clients on 127.0.0.1 and gives each a Session, or the fault that is armed. Everything
// runs on the thread of the io_context, which must outlive the server; so must the service.
class Server {
public:
    // Listens at once; throws boost::system::system_error when it cannot. Port 0 picks one.
    Server(boost::asio::io_context& context, Service& service, const ServerSettings& settings);
    ~Server();
    Server(const Server&) = delete;
    Server& operator=(const Server&) = delete;

    [[nodiscard]] std::uint16_t port() const { return endpoint.port(); }
    [[nodiscard]] std::size_t clients() const noexcept { return sessions.size(); }

    // Stops listening and drops every client.
    void stop();

private:
    void listen();
    void accept();
    void admit(boost::asio::ip::tcp::socket socket);
    void misbehave(boost::asio::ip::tcp::socket socket, FaultDesk::Play play, std::string body);
    // While a fault says so, or the service is down, nobody listens.
    void listenOrRefuse();
    void followPresence();

    boost::asio::ip::tcp::acceptor acceptor;
    boost::asio::steady_timer pause;
    Service& service;
    ServerSettings settings;
    boost::asio::ip::tcp::endpoint endpoint;
    bool stopped = false;
    std::set<std::shared_ptr<Client>> sessions;
};

}  // namespace raidsim
