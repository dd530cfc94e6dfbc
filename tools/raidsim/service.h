#pragma once

#include <chrono>
#include <functional>
#include <optional>
#include <string>
#include <variant>

#include "fault/desk.h"
#include "http/message.h"
#include "state/document.h"
#include "state/event_log.h"

namespace raidsim {

// What the service knows and answers; no sockets. Not for use by several threads.
class Service {
public:
    using Clock = std::function<std::chrono::system_clock::time_point()>;

    // The document may be reloaded from path.
    Service(
        Document initial, std::string path,
        Clock now = [] { return std::chrono::system_clock::now(); });

    // The answer is due when the log holds an event above lastRetrieved.
    struct EventAwaited {
        int lastRetrieved;
    };
    using Reply = std::variant<http::Answer, EventAwaited>;

    [[nodiscard]] Reply reply(const http::Request& request) const;
    [[nodiscard]] static http::Answer answerToWait(int sequenceNumber);

    // What the request asks for; nothing when it is not understood.
    [[nodiscard]] static std::optional<RequestKind> kindOf(const http::Request& request);

    // What a client would be answered that asks for this now, and waits for nothing.
    [[nodiscard]] std::string goodBody(RequestKind kind) const;

    // Serves the document of another file, or of the same one when the path is empty. Throws
    // FileError or XmlError and then goes on with the old document.
    void reload(const std::string& path = {});

    // Adds an event; date, serverName and serverAddress are filled in when they are not given.
    int addEvent(EventLog::Fields fields);

    [[nodiscard]] Document& document() noexcept { return served; }
    [[nodiscard]] EventLog& events() noexcept { return log; }
    [[nodiscard]] FaultDesk& faults() noexcept { return desk; }
    [[nodiscard]] const std::string& documentPath() const noexcept { return file; }

private:
    Document served;
    std::string file;
    Clock clock;
    EventLog log;
    FaultDesk desk;
};

}  // namespace raidsim
