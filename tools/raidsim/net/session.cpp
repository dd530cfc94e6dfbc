#include "net/session.h"

#include <boost/asio/buffer.hpp>
#include <boost/asio/write.hpp>
#include <string_view>
#include <utility>
#include <variant>

namespace raidsim {

namespace {

using boost::asio::ip::tcp;
using boost::system::error_code;

}  // namespace

Session::Session(tcp::socket client, Service& served, const ServerSettings& chosen, Closed closed,
                 HandOver taker)
    : socket(std::move(client)),
      timer(socket.get_executor()),
      service(served),
      settings(chosen),
      onClosed(std::move(closed)),
      handOver(std::move(taker)) {}

void Session::start() {
    limit(settings.requestTime);
    read();
}

void Session::refuse(const http::Refusal& refusal) {
    answer(http::fault(refusal));
    read();
}

void Session::close() {
    if (std::exchange(state, State::closed) == State::closed)
        return;
    if (ticket)
        service.events().cancel(*ticket);
    timer.cancel();
    error_code ignored;
    socket.close(ignored);
    onClosed(shared_from_this());
}

// A client that has its whole answer keeps it, as it does when a process dies.
void Session::reset() {
    error_code ignored;
    if (state != State::draining)
        socket.set_option(boost::asio::socket_base::linger(true, 0), ignored);
    close();
}

// One read is always under way until the client has ended, in every state: it brings the
// request, tells that a waiting client went away, and takes what the client still sends so that
// closing does not reset the connection before the answer is read.
void Session::read() {
    socket.async_read_some(boost::asio::buffer(chunk),
                           [self = shared_from_this()](error_code error, std::size_t count) {
                               if (self->state == State::closed)
                                   return;
                               if (error == boost::asio::error::eof) {
                                   self->ended();
                               } else if (error) {
                                   self->close();
                               } else {
                                   self->received(count);
                               }
                           });
}

void Session::received(std::size_t count) {
    if (state == State::reading) {
        request.append(chunk.data(), count);
        const http::Parsed parsed = http::parse(request);
        if (const auto* const whole = std::get_if<http::Request>(&parsed)) {
            handle(*whole);
        } else if (const auto* const refusal = std::get_if<http::Refusal>(&parsed)) {
            answer(http::fault(*refusal));
        }
    } else {
        drained += count;
        if (drained > bounds::drainBytes)
            close();
    }
    if (state != State::closed)
        read();
}

void Session::ended() {
    clientEnded = true;
    if (state == State::reading && !request.empty()) {
        answer(http::fault({400, "The request is incomplete"}));
    } else if (state != State::answering) {
        close();
    }
}

bool Session::handToFault(const http::Request& whole) {
    const auto kind = Service::kindOf(whole);
    auto play = kind ? service.faults().meetRequest(*kind) : std::nullopt;
    if (!play)
        return false;
    auto taken = std::move(socket);
    close();
    handOver(std::move(taken), std::move(*play), service.goodBody(*kind));
    return true;
}

void Session::handle(const http::Request& whole) {
    if (handToFault(whole))
        return;
    const Service::Reply reply = service.reply(whole);
    if (const auto* const ready = std::get_if<http::Answer>(&reply)) {
        answer(*ready);
        return;
    }
    if (std::holds_alternative<Service::NoAnswer>(reply)) {
        finish();
        return;
    }
    state = State::waiting;
    timer.cancel();
    const auto awaited = std::get<Service::EventAwaited>(reply);
    ticket = service.events().await(awaited.lastRetrieved,
                                    [self = shared_from_this()](std::optional<int> number) {
                                        self->ticket.reset();
                                        if (number) {
                                            self->answer(Service::answerToWait(*number));
                                        } else {
                                            self->finish();
                                        }
                                    });
    if (state != State::waiting)
        ticket.reset();
}

void Session::answer(const http::Answer& content) {
    state = State::answering;
    limit(settings.answerTime);
    bytes = http::format(content);
    boost::asio::async_write(socket, boost::asio::buffer(bytes),
                             [self = shared_from_this()](error_code error, std::size_t) {
                                 if (self->state == State::closed)
                                     return;
                                 if (error) {
                                     self->close();
                                 } else {
                                     self->finish();
                                 }
                             });
}

void Session::finish() {
    state = State::draining;
    error_code ignored;
    socket.shutdown(tcp::socket::shutdown_send, ignored);
    if (clientEnded) {
        close();
    } else {
        limit(settings.drainTime);
    }
}

void Session::limit(std::chrono::milliseconds time) {
    timer.expires_after(time);
    timer.async_wait([self = shared_from_this()](error_code cancelled) {
        if (!cancelled)
            self->timedOut();
    });
}

void Session::timedOut() {
    if (state == State::reading) {
        answer(http::fault({408, "The request did not arrive in time"}));
    } else {
        close();
    }
}

}  // namespace raidsim
