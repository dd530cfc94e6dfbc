#include "net/server.h"

#include <utility>

#include "net/fault_session.h"
#include "net/session.h"

namespace raidsim {

namespace {

using boost::asio::ip::tcp;
using boost::system::error_code;

// How long to wait before accepting again when the process is out of descriptors.
constexpr std::chrono::milliseconds acceptPause{100};

}  // namespace

Server::Server(boost::asio::io_context& context, Service& served, const ServerSettings& chosen)
    : acceptor(context),
      pause(context),
      service(served),
      settings(chosen),
      endpoint(boost::asio::ip::address_v4::loopback(), chosen.port) {
    listen();
    service.faults().changed = [this] { listenOrRefuse(); };
    service.presence().changed = [this] { followPresence(); };
    listenOrRefuse();
}

Server::~Server() {
    service.faults().changed = [] {};
    service.presence().changed = [] {};
    stop();
}

void Server::stop() {
    stopped = true;
    error_code ignored;
    acceptor.close(ignored);
    pause.cancel();
    // Sessions leave the set as they close.
    const auto open = std::exchange(sessions, {});
    for (const auto& session : open)
        session->close();
}

void Server::listen() {
    tcp::acceptor fresh(acceptor.get_executor(), endpoint.protocol());
    fresh.set_option(tcp::acceptor::reuse_address(true));
    fresh.bind(endpoint);
    fresh.listen();
    acceptor = std::move(fresh);
    endpoint = acceptor.local_endpoint();
    accept();
}

void Server::followPresence() {
    if (service.presence().isDown()) {
        // Sessions leave the set as they close.
        const auto open = std::exchange(sessions, {});
        for (const auto& session : open)
            session->reset();
    }
    listenOrRefuse();
}

void Server::listenOrRefuse() {
    const bool refuses = service.faults().refuses() || service.presence().isDown();
    if (stopped || refuses != acceptor.is_open())
        return;
    if (refuses) {
        acceptor.close();
    } else {
        listen();
    }
}

void Server::accept() {
    acceptor.async_accept([this](error_code error, tcp::socket socket) {
        if (error == boost::asio::error::operation_aborted || !acceptor.is_open())
            return;
        if (!error) {
            admit(std::move(socket));
            if (acceptor.is_open())
                accept();
            return;
        }
        pause.expires_after(acceptPause);
        pause.async_wait([this](error_code cancelled) {
            if (!cancelled)
                accept();
        });
    });
}

void Server::admit(tcp::socket socket) {
    if (auto play = service.faults().meetConnection()) {
        misbehave(std::move(socket), std::move(*play), service.goodBody(RequestKind::any));
        return;
    }
    const bool full = sessions.size() >= settings.clients;
    const auto session = std::make_shared<Session>(
        std::move(socket), service, settings,
        [this](const std::shared_ptr<Client>& closed) { sessions.erase(closed); },
        [this](tcp::socket taken, FaultDesk::Play play, std::string body) {
            misbehave(std::move(taken), std::move(play), std::move(body));
        });
    sessions.insert(session);
    if (full) {
        session->refuse({503, "Too many clients"});
    } else {
        session->start();
    }
}

void Server::misbehave(tcp::socket socket, FaultDesk::Play play, std::string body) {
    const auto session = std::make_shared<FaultSession>(
        std::move(socket), service.faults(), std::move(play), std::move(body),
        [this](const std::shared_ptr<Client>& closed) { sessions.erase(closed); });
    sessions.insert(session);
    session->start();
}

}  // namespace raidsim
