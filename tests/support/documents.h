#pragma once

#include <string>
#include <string_view>

// Answers as the service writes them.
namespace raid::test {

// The SOAP envelope around the response element `response`.
[[nodiscard]] std::string envelope(std::string_view response);

// `system` is the whole "ac:system" element.
[[nodiscard]] std::string configDocument(std::string_view system);
// `events` is the whole "ac:events" element.
[[nodiscard]] std::string eventsDocument(std::string_view events);
// The answer to "getNewestEvent"; the value is text, so that malformed numbers can be sent too.
[[nodiscard]] std::string newestEventDocument(std::string_view value);

// "HTTP/1.1 200 OK", the length, an empty line (all ending in a bare LF) and the body.
[[nodiscard]] std::string answer(std::string_view body);

}  // namespace raid::test
