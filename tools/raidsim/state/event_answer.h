#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

namespace raidsim {

// What stands around the events in an answer to getEvents, and the whole answer when there is none.
struct EventFrame {
    std::string head;
    std::string tail;
    std::string empty;
};

// An event as an answer lists it: what separates it from what is in front, and its element.
struct ListedEvent {
    int sequenceNumber;
    std::string gap;
    std::string bytes;
};

// An answer to getEvents. Head, the events with their gaps, and tail are its bytes.
struct EventAnswer {
    EventFrame frame;
    std::vector<ListedEvent> events;
};

// Nothing for an answer that has no list of numbered events, or is not well-formed.
[[nodiscard]] std::optional<EventAnswer> cutEventAnswer(const std::string& body);

// The frame of the events that the service makes itself, and what it puts in front of each.
[[nodiscard]] EventFrame ownEventFrame();
inline constexpr const char* ownEventGap = "\n        ";
inline constexpr std::size_t ownEventDepth = 4;

}  // namespace raidsim
