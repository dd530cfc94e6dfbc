#pragma once

#include <array>
#include <boost/asio/ip/tcp.hpp>
#include <boost/asio/steady_timer.hpp>
#include <cstddef>
#include <memory>
#include <string>

#include "fault/desk.h"
#include "net/client.h"

namespace raidsim {

// One client that meets a fault: plays the steps of a case, one after the other.
class FaultSession : public Client, public std::enable_shared_from_this<FaultSession> {
public:
    // A fault that begins with the request finds it read. goodBody is what a good answer would
    // hold.
    FaultSession(boost::asio::ip::tcp::socket client, FaultDesk& desk, FaultDesk::Play play,
                 std::string goodBody, Closed closed);

    void start() override;
    void close() override;
    void reset() override;

private:
    void next();
    void perform(const FaultStep& step);
    void readRequest();
    void readUpTo(std::size_t bytes);
    void sendUpTo(std::size_t end);
    void sendOn();
    void whenTaken(void (FaultSession::*then)());
    void shutDown();
    void drain();
    void stall();

    boost::asio::ip::tcp::socket socket;
    boost::asio::steady_timer timer;
    FaultDesk& desk;
    FaultDesk::Play play;
    std::string goodBody;
    FaultAnswer answer;
    Closed onClosed;
    unsigned generation;
    bool open = true;
    std::size_t step = 0;
    std::size_t sent = 0;
    std::size_t sendEnd = 0;
    std::size_t pieceBytes = 0;  // 0: whatever a write takes
    std::string request;
    std::array<char, 4096> chunk{};
};

}  // namespace raidsim
