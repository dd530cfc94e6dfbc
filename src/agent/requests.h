#pragma once

#include <string>

namespace raid::agent {

// The service wants its GET requests so: request line and Accept header on one line.
inline constexpr const char* configurationRequest =
    "GET /SOAPService/DataProcessor?getConfig HTTP/1.1 Accept */*\r\n\r\n";
inline constexpr const char* eventListRequest =
    "GET /SOAPService/RaidMonitor?getEvents HTTP/1.1 Accept */*\r\n\r\n";

/// Asks for the number of the newest event.
[[nodiscard]] std::string newestEventRequest();

/// Is answered when there is an event after the given one.
[[nodiscard]] std::string waitNextEventRequest(int lastRetrieved);

/// Asks for the events of a range, both ends included.
[[nodiscard]] std::string eventsRequest(int start, int end);

}  // namespace raid::agent
