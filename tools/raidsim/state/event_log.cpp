#include "state/event_log.h"

#include <algorithm>
#include <array>
#include <limits>
#include <optional>
#include <string_view>

#include "soap/envelope.h"
#include "text.h"

namespace raidsim {

namespace {

struct Field {
    std::string_view name;
    const char* xsiType;
};

constexpr const char* number = "xsd:int";
constexpr const char* string = "xsd:string";

// In the order in which they are written.
constexpr std::array<Field, 13> vocabulary{{
    {"sequenceNumber", number},
    {"date", string},
    {"type", string},
    {"eventCode", number},
    {"string", string},
    {"serverName", string},
    {"serverAddress", string},
    {"adapter", number},
    {"channel", number},
    {"deviceID", number},
    {"enclosureID", number},
    {"logicalDrive", number},
    {"fru", string},
}};

std::optional<std::string> valueOf(const EventLog::Fields& fields, std::string_view name) {
    std::optional<std::string> value;
    for (const auto& [field, written] : fields) {
        if (field == name)
            value = written;
    }
    return value;
}

}  // namespace

void EventLog::check(const Fields& fields) {
    for (const auto& [name, value] : fields) {
        const auto field = std::ranges::find(vocabulary, name, &Field::name);
        if (field == vocabulary.end())
            throw EventError("an event has no field \"" + name + "\"");
        if (field->xsiType == number && !parseInt(value))
            throw EventError("\"" + value + "\" is not a number");
    }
}

int EventLog::append(const Fields& fields) {
    check(fields);
    const auto given = valueOf(fields, "sequenceNumber");
    if (!given && last == std::numeric_limits<int>::max())
        throw EventError("there are no more sequence numbers");
    const int sequenceNumber = given ? parseInt(*given).value() : last + 1;
    if (sequenceNumber <= last) {
        throw EventError("sequenceNumber " + std::to_string(sequenceNumber) +
                         " is not above the newest, " + std::to_string(last));
    }

    xml::Tree event = xml::element("o:Event");
    for (const Field& field : vocabulary) {
        const auto value = field.name == "sequenceNumber" ? std::to_string(sequenceNumber)
                                                          : valueOf(fields, field.name);
        if (value)
            xml::addText(event, "as:" + std::string(field.name), field.xsiType, *value);
    }
    events.push_back({sequenceNumber, event});
    if (events.size() > capacity)
        events.pop_front();
    last = sequenceNumber;
    release(sequenceNumber);
    return sequenceNumber;
}

std::string EventLog::body(int start, int end) const {
    xml::Tree list = xml::element("o:Events");
    for (auto entry = std::ranges::lower_bound(events, start, {}, &Entry::sequenceNumber);
         entry != events.end() && entry->sequenceNumber <= end; ++entry)
        xml::addChild(list, "ac:event", entry->event);
    xml::Tree content;
    xml::addChild(content, "ac:events", list);
    return xml::format(soap::envelope("m:getEventsResponse", content));
}

EventLog::Ticket EventLog::await(int lastRetrieved, Waiter waiter) {
    const auto next = std::ranges::upper_bound(events, lastRetrieved, {}, &Entry::sequenceNumber);
    const Ticket ticket = nextTicket++;
    if (next != events.end()) {
        waiter(next->sequenceNumber);
    } else {
        waiters.emplace(ticket, Wait{lastRetrieved, std::move(waiter)});
    }
    return ticket;
}

void EventLog::release(int sequenceNumber) {
    // Waiters may wait again or cancel others, so the due ones are taken out first.
    std::vector<Waiter> due;
    for (auto wait = waiters.begin(); wait != waiters.end();) {
        if (wait->second.lastRetrieved < sequenceNumber) {
            due.push_back(std::move(wait->second.waiter));
            wait = waiters.erase(wait);
        } else {
            ++wait;
        }
    }
    for (const Waiter& waiter : due)
        waiter(sequenceNumber);
}

}  // namespace raidsim
