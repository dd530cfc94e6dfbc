#pragma once

#include <cstring>
#include <string>
#include <string_view>

#include "agent/agent_link.h"
#include "agent/envelope.h"
#include "support/documents.h"
#include "support/elements.h"

namespace raid::test {

// A buffer of exactly the text's bytes, for a processor to free.
[[nodiscard]] inline char* handOver(std::string_view text) {
    auto* const buffer = static_cast<char*>(std::malloc(text.size()));
    return static_cast<char*>(std::memcpy(buffer, text.data(), text.size()));
}

inline int process(int (*processor)(char*, int), std::string_view document) {
    return processor(handOver(document), static_cast<int>(document.size()));
}

[[nodiscard]] inline std::string systemNamed(std::string_view os) {
    return configDocument(element("ac:system", element("as:os", os)));
}

[[nodiscard]] inline std::string eventsNumbered(int first, int count) {
    std::string events;
    for (int at = 0; at < count; ++at) {
        events += element("ac:event", element("as:sequenceNumber", first + at));
    }
    return eventsDocument(element("ac:events", events));
}

// What the current model was read from: the system's "as:os", or "none".
[[nodiscard]] inline std::string currentSystem() {
    return getRAIDSystem() == nullptr ? "none" : getRAIDSystem()->getOS();
}

// The number of events in the current batch; -1 without one.
[[nodiscard]] inline int currentEvents() {
    return getRAIDEvents() == nullptr ? -1 : static_cast<int>(getRAIDEvents()->getEvents().size());
}

}  // namespace raid::test
