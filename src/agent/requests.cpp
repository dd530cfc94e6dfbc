#include "agent/requests.h"

#include <string_view>

namespace raid::agent {
namespace {

constexpr std::string_view envelopeStart =
    "<?xml version='1.0' ?>"
    "<env:Envelope xmlns:env=\"http://www.w3.org/2002/12/soap-envelope\""
    " xmlns:xsi=\"http://www.w3.org/2001/XMLSchema-instance\""
    " xmlns:xsd=\"http://www.w3.org/2001/XMLSchema-datatypes\">"
    "<env:Body>";
constexpr std::string_view envelopeEnd = "</env:Body></env:Envelope>";
constexpr std::string_view namespaces =
    " xmlns:m=\"http://localhost/soap/v1/method\""
    " xmlns:as=\"http://localhost/soap/v1/argSimple\"";

// Bare LF line ends, and no space after "Content-Length:".
constexpr std::string_view header =
    "POST /SOAPService/RaidMonitor HTTP/1.1\n"
    "Content-Type: application/soap+xml; charset=\"utf-8\"\n"
    "Content-Length:";

std::string join(std::initializer_list<std::string_view> pieces) {
    std::string joined;
    for (const auto piece : pieces) {
        joined += piece;
    }
    return joined;
}

std::string argument(std::string_view name, int value) {
    return join(
        {"<as:", name, " xsi:type=\"xsd:int\">", std::to_string(value), "</as:", name, ">"});
}

std::string request(std::string_view method, std::string_view arguments) {
    const auto envelope = join({envelopeStart, "<m:", method, namespaces, ">", arguments,
                                "</m:", method, ">", envelopeEnd});
    return join({header, std::to_string(envelope.size()), "\n\n", envelope});
}

}  // namespace

std::string newestEventRequest() { return request("getNewestEvent", {}); }

std::string waitNextEventRequest(int lastRetrieved) {
    return request("waitNextEvent", argument("lastRetrieved", lastRetrieved));
}

std::string eventsRequest(int start, int end) {
    return request("getEvents", argument("start", start) + argument("end", end));
}

}  // namespace raid::agent
