#include "client.h"

#include <poll.h>

#include <boost/asio/buffer.hpp>
#include <boost/asio/read.hpp>
#include <boost/asio/write.hpp>
#include <boost/system/system_error.hpp>
#include <stdexcept>

namespace raidsim::test {

namespace {

using boost::asio::ip::tcp;

std::string call(const std::string& method, const std::string& arguments) {
    return post(
        "<?xml version='1.0' ?><env:Envelope "
        "xmlns:env=\"http://www.w3.org/2002/12/soap-envelope\" "
        "xmlns:xsi=\"http://www.w3.org/2001/XMLSchema-instance\" "
        "xmlns:xsd=\"http://www.w3.org/2001/XMLSchema-datatypes\"><env:Body><m:" +
        method +
        " xmlns:m=\"http://localhost/soap/v1/method\" "
        "xmlns:as=\"http://localhost/soap/v1/argSimple\">" +
        arguments + "</m:" + method + "></env:Body></env:Envelope>");
}

std::string argument(const std::string& name, int value) {
    return "<as:" + name + " xsi:type=\"xsd:int\">" + std::to_string(value) + "</as:" + name + ">";
}

}  // namespace

Client::Client(std::uint16_t port) {
    socket.connect(tcp::endpoint(boost::asio::ip::address_v4::loopback(), port));
}

void Client::send(std::string_view bytes) {
    boost::asio::write(socket, boost::asio::buffer(bytes.data(), bytes.size()));
}

void Client::endSending() { socket.shutdown(tcp::socket::shutdown_send); }

std::string Client::receive() {
    std::string received;
    boost::system::error_code error;
    boost::asio::read(socket, boost::asio::dynamic_buffer(received), error);
    if (error != boost::asio::error::eof)
        throw boost::system::system_error(error);
    return received;
}

bool Client::isThere(short what, int time) {
    pollfd look{socket.native_handle(), what, 0};
    return ::poll(&look, 1, time) != 0;
}

bool Client::isAnswered() { return isThere(POLLIN, 0); }

void Client::awaitWholeAnswer() {
    constexpr int patience = 60'000;
    if (!isThere(POLLRDHUP, patience))
        throw std::runtime_error("the service has not ended its answer");
}

std::string ask(std::uint16_t port, std::string_view request) {
    Client client(port);
    client.send(request);
    return client.receive();
}

std::string bodyOf(std::string_view answer) {
    const auto end = answer.find("\n\n");
    return std::string(end == std::string_view::npos ? "" : answer.substr(end + 2));
}

std::string post(std::string_view envelope) {
    std::string request =
        "POST /SOAPService/RaidMonitor HTTP/1.1\nContent-Type: application/soap+xml; "
        "charset=\"utf-8\"\nContent-Length:";
    return request.append(std::to_string(envelope.size())).append("\n\n").append(envelope);
}

std::string getNewestEvent() { return call("getNewestEvent", ""); }

std::string waitNextEvent(int lastRetrieved) {
    return call("waitNextEvent", argument("lastRetrieved", lastRetrieved));
}

std::string getEvents(int start, int end) {
    return call("getEvents", argument("start", start) + argument("end", end));
}

}  // namespace raidsim::test
