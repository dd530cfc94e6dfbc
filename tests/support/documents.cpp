#include "support/documents.h"

namespace raid::test {

namespace {

std::string response(std::string_view method, std::string_view content) {
    std::string text;
    text.append("<m:").append(method);
    text.append(
        " xmlns:m=\"http://localhost/soap/v1/method\""
        " xmlns:as=\"http://localhost/soap/v1/argSimple\""
        " xmlns:ac=\"http://localhost/soap/v1/argComplex\">");
    text.append(content);
    text.append("</m:").append(method).append(">");
    return text;
}

}  // namespace

std::string envelope(std::string_view response) {
    std::string text =
        "<?xml version='1.0' ?>"
        "<env:Envelope xmlns:env=\"http://www.w3.org/2002/12/soap-envelope\""
        " xmlns:xsi=\"http://www.w3.org/2001/XMLSchema-instance\""
        " xmlns:xsd=\"http://www.w3.org/2001/XMLSchema-datatypes\">"
        "<env:Body>";
    text.append(response);
    text.append("</env:Body></env:Envelope>");
    return text;
}

std::string configDocument(std::string_view system) {
    return envelope(response("getConfigResponse", system));
}

std::string eventsDocument(std::string_view events) {
    return envelope(response("getEventsResponse", events));
}

std::string newestEventDocument(std::string_view value) {
    std::string element = "<as:return xsi:type=\"xsd:int\">";
    element.append(value).append("</as:return>");
    return envelope(response("getNewestEventResponse", element));
}

std::string answer(std::string_view body) {
    std::string text = "HTTP/1.1 200 OK\nContent-Type: application/soap+xml; charset=\"utf-8\"\n";
    text.append("Content-Length: ").append(std::to_string(body.size())).append("\n\n");
    text.append(body);
    return text;
}

}  // namespace raid::test
