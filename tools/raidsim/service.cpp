#include "service.h"

#include <array>
#include <limits>
#include <utility>

#include "overloaded.h"
#include "soap/envelope.h"
#include "soap/request.h"
#include "text.h"

namespace raidsim {

namespace {

constexpr std::string_view processor = "/SOAPService/DataProcessor";
constexpr std::string_view monitor = "/SOAPService/RaidMonitor";

constexpr std::pair everyEvent{std::numeric_limits<int>::min(), std::numeric_limits<int>::max()};

Service::Reply replyToCall(const soap::Request& call, const EventLog& log) {
    using Reply = Service::Reply;
    return std::visit(Overloaded{
                          [&](const soap::GetNewestEvent&) -> Reply {
                              return http::Answer{
                                  200,
                                  soap::returnValueBody("m:getNewestEventResponse", log.newest())};
                          },
                          [](const soap::WaitNextEvent& wait) -> Reply {
                              return Service::EventAwaited{wait.lastRetrieved};
                          },
                          [&](const soap::GetEvents& range) -> Reply {
                              return http::Answer{200, log.body(range.start, range.end)};
                          },
                      },
                      call);
}

}  // namespace

Service::Service(Document initial, std::string path, Clock now)
    : served(std::move(initial)), file(std::move(path)), clock(std::move(now)) {}

std::optional<RequestKind> Service::kindOf(const http::Request& request) {
    if (request.method == "GET") {
        if (request.target == std::string(processor) + "?getConfig")
            return RequestKind::config;
        if (request.target == std::string(monitor) + "?getEvents")
            return RequestKind::events;
        return std::nullopt;
    }
    if (request.target != monitor)
        return std::nullopt;
    try {
        return std::visit(Overloaded{
                              [](const soap::GetNewestEvent&) { return RequestKind::newest; },
                              [](const soap::WaitNextEvent&) { return RequestKind::wait; },
                              [](const soap::GetEvents&) { return RequestKind::events; },
                          },
                          soap::decode(request.body));
    } catch (const soap::RequestError&) {
        return std::nullopt;
    }
}

Service::Reply Service::reply(const http::Request& request) const {
    if (!substitutes.empty()) {
        const auto kind = kindOf(request);
        const auto found = kind ? substitutes.find(*kind) : substitutes.end();
        if (found != substitutes.end())
            return found->second ? Reply(http::Answer{200, *found->second}) : Reply(NoAnswer{});
    }
    return ownReply(request);
}

Service::Reply Service::ownReply(const http::Request& request) const {
    const bool get = request.method == "GET";
    const std::string_view target = request.target;
    if (get && target == std::string(processor) + "?getConfig")
        return http::Answer{200, served.body()};
    if (get && target == std::string(monitor) + "?getEvents") {
        return http::Answer{200, log.body(everyEvent.first, everyEvent.second)};
    }
    if (get || target != monitor)
        return http::fault({404, "There is no service at this address"});
    try {
        return replyToCall(soap::decode(request.body), log);
    } catch (const soap::RequestError& error) {
        return http::fault({400, error.what()});
    }
}

std::string Service::goodBody(RequestKind kind) const {
    const auto found = substitutes.find(kind);
    if (found != substitutes.end() && found->second)
        return *found->second;
    switch (kind) {
        case RequestKind::config:
        case RequestKind::any:
            break;
        case RequestKind::events:
            return log.body(everyEvent.first, everyEvent.second);
        case RequestKind::wait:
            return answerToWait(log.newest()).body;
        case RequestKind::newest:
            return soap::returnValueBody("m:getNewestEventResponse", log.newest());
    }
    return served.body();
}

http::Answer Service::answerToWait(int sequenceNumber) {
    return {200, soap::returnValueBody("m:waitNextEventResponse", sequenceNumber)};
}

void Service::reload(const std::string& path) {
    const std::string& source = path.empty() ? file : path;
    serve(Document::read(source));
    file = source;
}

void Service::serve(Document next) {
    served = std::move(next);
    answerFromState(RequestKind::config);
}

void Service::substitute(RequestKind kind, std::optional<std::string> body) {
    substitutes.insert_or_assign(kind, std::move(body));
}

int Service::addEvent(EventLog::Fields fields, const std::optional<EventPlace>& place) {
    const std::array<std::pair<const char*, std::string>, 3> defaults{{
        {"date", formatUtc(clock())},
        {"serverName", served.systemName()},
        {"serverAddress", "127.0.0.1"},
    }};
    // In front, so that a given value overrides.
    fields.insert(fields.begin(), defaults.begin(), defaults.end());
    const int number = place ? log.insert(fields, *place) : log.append(fields);
    answerFromState(RequestKind::newest);
    return number;
}

}  // namespace raidsim
