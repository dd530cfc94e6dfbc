#pragma once

#include <chrono>
#include <functional>
#include <map>
#include <optional>
#include <string>
#include <variant>

#include "fault/desk.h"
#include "http/message.h"
#include "state/document.h"
#include "state/event_log.h"
#include "state/presence.h"

namespace raidsim {

// What the service knows and answers; no sockets. Not for use by several threads.
class Service {
public:
    using Clock = std::function<std::chrono::sys_seconds()>;

    // The document may be reloaded from path.
    Service(
        Document initial, std::string path, Clock now = [] {
            return std::chrono::floor<std::chrono::seconds>(std::chrono::system_clock::now());
        });

    // The answer is due when the log holds an event above lastRetrieved.
    struct EventAwaited {
        int lastRetrieved;
    };
    // The connection ends without an answer.
    struct NoAnswer {};
    using Reply = std::variant<http::Answer, EventAwaited, NoAnswer>;

    [[nodiscard]] Reply reply(const http::Request& request) const;
    [[nodiscard]] static http::Answer answerToWait(int sequenceNumber);

    // What the request asks for; nothing when it is not understood.
    [[nodiscard]] static std::optional<RequestKind> kindOf(const http::Request& request);

    // What a client would be answered that asks for this now, and waits for nothing.
    [[nodiscard]] std::string goodBody(RequestKind kind) const;

    // Serves the document of another file, or of the same one when the path is empty. Throws
    // FileError or XmlError and then goes on with the old document.
    void reload(const std::string& path = {});
    void serve(Document next);

    // From now on requests of a kind are answered with these bytes, or, where there are none, with
    // nothing; or again with what the document and the log give.
    void substitute(RequestKind kind, std::optional<std::string> body);
    void answerFromState(RequestKind kind) { substitutes.erase(kind); }

    // Adds an event, at the end and with a number that rises unless a place is given; date,
    // serverName and serverAddress are filled in when they are not given.
    int addEvent(EventLog::Fields fields, const std::optional<EventPlace>& place = {});

    [[nodiscard]] Document& document() noexcept { return served; }
    [[nodiscard]] EventLog& events() noexcept { return log; }
    [[nodiscard]] FaultDesk& faults() noexcept { return desk; }
    [[nodiscard]] Presence& presence() noexcept { return there; }
    [[nodiscard]] const std::string& documentPath() const noexcept { return file; }

private:
    [[nodiscard]] Reply ownReply(const http::Request& request) const;

    Document served;
    std::string file;
    Clock clock;
    EventLog log;
    FaultDesk desk;
    Presence there;
    std::map<RequestKind, std::optional<std::string>> substitutes;
};

}  // namespace raidsim
