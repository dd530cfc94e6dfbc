#pragma once

#include <boost/asio/io_context.hpp>
#include <boost/asio/ip/tcp.hpp>
#include <cstdint>
#include <string>
#include <string_view>

namespace raidsim::test {

// A blocking connection to a service on 127.0.0.1.
class Client {
public:
    explicit Client(std::uint16_t port);

    void send(std::string_view bytes);
    void endSending();
    // Everything up to the end of the connection.
    [[nodiscard]] std::string receive();
    // Whether anything, be it the end, can be received at this moment.
    [[nodiscard]] bool isAnswered();
    // Returns when the service has sent all that it will. Throws std::runtime_error after a minute.
    void awaitWholeAnswer();

private:
    // Within the time, which is in milliseconds.
    [[nodiscard]] bool isThere(short what, int time);

    boost::asio::io_context context;
    boost::asio::ip::tcp::socket socket{context};
};

// One whole exchange.
[[nodiscard]] std::string ask(std::uint16_t port, std::string_view request);

[[nodiscard]] std::string bodyOf(std::string_view answer);

// A POST as the service's clients write it.
[[nodiscard]] std::string post(std::string_view envelope);
[[nodiscard]] std::string getNewestEvent();
[[nodiscard]] std::string waitNextEvent(int lastRetrieved);
[[nodiscard]] std::string getEvents(int start, int end);

inline constexpr std::string_view getConfig =
    "GET /SOAPService/DataProcessor?getConfig HTTP/1.1 Accept */*\r\n\r\n";

}  // namespace raidsim::test
