#include "net/server.h"

#include <utility>

#include "net/session.h"

namespace raidsim {

namespace {

using boost::asio::ip::tcp;
using boost::system::error_code;

// How long to wait before accepting again when the process is out of descriptors.
constexpr std::chrono::milliseconds acceptPause{100};

}  // namespace

Server::Server(boost::asio::io_context& context, Service& served, const ServerSettings& chosen)
    : acceptor(context, tcp::endpoint(boost::asio::ip::address_v4::loopback(), chosen.port)),
      pause(context),
      service(served),
      settings(chosen) {
    accept();
}

Server::~Server() { stop(); }

std::uint16_t Server::port() const { return acceptor.local_endpoint().port(); }

void Server::stop() {
    error_code ignored;
    acceptor.close(ignored);
    pause.cancel();
    // Sessions leave the set as they close.
    const auto open = std::exchange(sessions, {});
    for (const auto& session : open)
        session->close();
}

void Server::accept() {
    acceptor.async_accept([this](error_code error, tcp::socket socket) {
        if (error == boost::asio::error::operation_aborted || !acceptor.is_open())
            return;
        if (!error) {
            admit(std::move(socket));
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
    const bool full = sessions.size() >= settings.clients;
    auto session = std::make_shared<Session>(
        std::move(socket), service, settings,
        [this](const std::shared_ptr<Session>& closed) { sessions.erase(closed); });
    sessions.insert(session);
    if (full) {
        session->refuse({503, "Too many clients"});
    } else {
        session->start();
    }
}

}  // namespace raidsim
