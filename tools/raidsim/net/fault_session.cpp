#include "net/fault_session.h"

#include <poll.h>

#include <algorithm>
#include <boost/asio/buffer.hpp>
#include <boost/asio/read.hpp>
#include <boost/asio/write.hpp>
#include <utility>
#include <variant>

#include "http/message.h"
#include "net/unread.h"

namespace raidsim {

namespace {

using boost::asio::ip::tcp;
using boost::system::error_code;
using StepKind = FaultStep::Kind;

constexpr std::chrono::microseconds glance{100};  // between two looks at what has no event

}  // namespace

FaultSession::FaultSession(tcp::socket client, FaultDesk& faults, FaultDesk::Play met,
                           std::string body, Closed closed)
    : socket(std::move(client)),
      timer(socket.get_executor()),
      desk(faults),
      play(std::move(met)),
      goodBody(std::move(body)),
      onClosed(std::move(closed)),
      generation(desk.generation()) {}

void FaultSession::start() {
    desk.tell("fault: " + play.label);
    try {
        answer = answerOf(play.chosen, std::move(goodBody));
    } catch (const std::runtime_error& error) {
        desk.tell(std::string("fault: it cannot be played: ") + error.what());
        close();
        return;
    }
    error_code ignored;
    socket.set_option(tcp::no_delay(true), ignored);
    if (play.chosen.beginsWithRequest())
        step = 1;
    next();
}

void FaultSession::close() {
    if (!std::exchange(open, false))
        return;
    timer.cancel();
    error_code ignored;
    socket.close(ignored);
    desk.tell("fault: over");
    onClosed(shared_from_this());
}

void FaultSession::next() {
    if (open)
        perform(play.chosen.steps[step++]);
}

void FaultSession::perform(const FaultStep& now) {
    switch (now.kind) {
        case StepKind::readRequest:
            readRequest();
            break;
        case StepKind::read:
            readUpTo(now.bytes);
            break;
        case StepKind::send:
            if (now.bytes == FaultStep::rest) {
                sendUpTo(answer.bytes.size());
            } else {
                sendUpTo(now.bytes == FaultStep::header ? answer.headerSize : sent + now.bytes);
            }
            break;
        case StepKind::pieces:
            pieceBytes = now.bytes;
            next();
            break;
        case StepKind::taken:
            whenTaken(&FaultSession::next);
            break;
        case StepKind::pause:
            timer.expires_after(now.time);
            timer.async_wait([self = shared_from_this()](error_code) { self->next(); });
            break;
        case StepKind::close:
            shutDown();
            break;
        case StepKind::reset:
            whenTaken(&FaultSession::reset);
            break;
        case StepKind::stall:
            desk.tell("fault: stalled");
            stall();
            break;
    }
}

void FaultSession::readRequest() {
    socket.async_read_some(boost::asio::buffer(chunk), [self = shared_from_this()](
                                                           error_code error, std::size_t count) {
        self->request.append(self->chunk.data(), count);
        const bool whole = !std::holds_alternative<http::Incomplete>(http::parse(self->request));
        if (error || whole) {
            self->next();
        } else {
            self->readRequest();
        }
    });
}

void FaultSession::readUpTo(std::size_t bytes) {
    boost::asio::async_read(
        socket, boost::asio::buffer(chunk, std::min(bytes, chunk.size())),
        [self = shared_from_this(), bytes](error_code error, std::size_t count) {
            if (error || count == bytes) {
                self->next();
            } else {
                self->readUpTo(bytes - count);
            }
        });
}

void FaultSession::sendUpTo(std::size_t end) {
    sendEnd = std::min(end, answer.bytes.size());
    sendOn();
}

void FaultSession::sendOn() {
    if (sent >= sendEnd) {
        next();
        return;
    }
    const std::size_t left = sendEnd - sent;
    const std::size_t size = pieceBytes == 0 ? left : std::min(pieceBytes, left);
    boost::asio::async_write(socket, boost::asio::buffer(answer.bytes.data() + sent, size),
                             [self = shared_from_this()](error_code error, std::size_t count) {
                                 self->sent += count;
                                 if (error) {
                                     self->close();
                                 } else if (self->sent == self->sendEnd) {
                                     self->next();
                                 } else {
                                     // The piece must be taken before the next one leaves.
                                     self->whenTaken(&FaultSession::sendOn);
                                 }
                             });
}

void FaultSession::whenTaken(void (FaultSession::*then)()) {
    if (!open || !clientHasUnread(socket)) {
        (this->*then)();
        return;
    }
    timer.expires_after(glance);
    timer.async_wait([self = shared_from_this(), then](error_code) { self->whenTaken(then); });
}

// An orderly end: what the client still sends is read, so that the kernel does not reset.
void FaultSession::shutDown() {
    error_code ignored;
    socket.shutdown(tcp::socket::shutdown_send, ignored);
    drain();
}

void FaultSession::drain() {
    socket.async_read_some(boost::asio::buffer(chunk),
                           [self = shared_from_this()](error_code error, std::size_t) {
                               if (error) {
                                   self->close();
                               } else {
                                   self->drain();
                               }
                           });
}

void FaultSession::reset() {
    error_code ignored;
    socket.set_option(boost::asio::socket_base::linger(true, 0), ignored);
    close();
}

// Until the client closes, or the desk is told to stop. What the client sends is not read, so its
// end must be asked for.
void FaultSession::stall() {
    if (!open)
        return;
    pollfd end{socket.native_handle(), POLLRDHUP, 0};
    if (poll(&end, 1, 0) != 0 || desk.generation() != generation) {
        close();
        return;
    }
    timer.expires_after(glance);
    timer.async_wait([self = shared_from_this()](error_code) { self->stall(); });
}

}  // namespace raidsim
