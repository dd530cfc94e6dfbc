#include "events/wait.h"

#include <algorithm>
#include <cstdlib>
#include <cstring>
#include <limits>
#include <new>
#include <string_view>
#include <utility>

namespace raidinfo {
namespace {

/// From a larger number on the library would ask for numbers beyond the largest.
constexpr int lastAsked = std::numeric_limits<int>::max() - (numbersAsked - 1);

/// No event has a number below 0.
constexpr int markNumber = -1;

constexpr std::string_view mark =
    "<?xml version=\"1.0\"?><env:Envelope><env:Body><m:getEventsResponse><ac:events><ac:event>"
    "<as:sequenceNumber>-1</as:sequenceNumber></ac:event></ac:events></m:getEventsResponse>"
    "</env:Body></env:Envelope>";

bool isMark(const Records& events) {
    return events.size() == 1 &&
           numberOf(eventKind(), events.front(), "sequence_number") == markNumber;
}

}  // namespace

EventWait::EventWait(const Library& library)
    : reader{library},
      process{library.function<int(char*, int)>("_Z15processEventXMLPci")},
      setNext{library.function<void(int)>("setRAIDEventSequenceNumber")},
      wait{library.function<int()>("getEvent")},
      batch{library.variable<const void*>("raidEvents")} {}

Awaited EventWait::from(std::int64_t number) {
    leaveMark();
    setNext(static_cast<int>(std::min<std::int64_t>(number, lastAsked)));
    wait();
    if (*batch == nullptr) {
        return {Awaited::Outcome::malformed, {}};
    }
    Records events = reader.read(eventKind());
    if (isMark(events)) {
        return {Awaited::Outcome::failed, {}};
    }
    return {Awaited::Outcome::read, std::move(events)};
}

void EventWait::leaveMark() const {
    // NOLINTNEXTLINE(cppcoreguidelines-no-malloc): the library frees it
    auto* const document = static_cast<char*>(std::malloc(mark.size() + 1));
    if (document == nullptr) {
        throw std::bad_alloc{};
    }
    std::memcpy(document, mark.data(), mark.size());
    document[mark.size()] = '\0';
    process(document, static_cast<int>(mark.size()));
}

}  // namespace raidinfo
