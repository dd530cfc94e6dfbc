#include "state/event_log.h"

#include <algorithm>
#include <array>
#include <limits>
#include <string_view>

#include "text.h"
#include "xml/tree.h"

namespace raidsim {

namespace {

struct Field {
    std::string_view name;
    const char* xsiType;
};

constexpr const char* asNumber = "xsd:int";
constexpr const char* asText = "xsd:string";

// In the order in which they are written.
constexpr std::array<Field, 13> vocabulary{{
    {"sequenceNumber", asNumber},
    {"date", asText},
    {"type", asText},
    {"eventCode", asNumber},
    {"string", asText},
    {"serverName", asText},
    {"serverAddress", asText},
    {"adapter", asNumber},
    {"channel", asNumber},
    {"deviceID", asNumber},
    {"enclosureID", asNumber},
    {"logicalDrive", asNumber},
    {"fru", asText},
}};

std::optional<std::string> valueOf(const EventLog::Fields& fields, std::string_view name) {
    std::optional<std::string> value;
    for (const auto& [field, written] : fields) {
        if (field == name)
            value = written;
    }
    return value;
}

constexpr int lowest = 1;
constexpr int highest = std::numeric_limits<int>::max();

// The number given, or the next one.
int numberIn(const EventLog::Fields& fields, int newest) {
    if (const auto given = valueOf(fields, "sequenceNumber"))
        return parseInt(*given).value();
    if (newest == highest)
        throw EventError("there are no more sequence numbers");
    return newest + 1;
}

}  // namespace

const EventLog::Frame& EventLog::ownFrame() {
    static const auto own = std::make_shared<const EventFrame>(ownEventFrame());
    return own;
}

void EventLog::check(const Fields& fields) {
    for (const auto& [name, value] : fields) {
        const auto field = std::ranges::find(vocabulary, name, &Field::name);
        if (field == vocabulary.end())
            throw EventError("an event has no field \"" + name + "\"");
        if (field->xsiType == asNumber && !parseInt(value))
            throw EventError("\"" + value + "\" is no number from -2147483648 to 2147483647");
    }
}

void EventLog::checkWithoutPlace(const Fields& fields) {
    check(fields);
    const auto given = valueOf(fields, "sequenceNumber");
    if (given && parseInt(*given).value() < lowest) {
        throw EventError("sequenceNumber " + *given + " needs a place: numbers start at " +
                         std::to_string(lowest));
    }
}

int EventLog::append(const Fields& fields) {
    checkWithoutPlace(fields);
    const int number = numberIn(fields, last);
    if (number <= last) {
        throw EventError("sequenceNumber " + std::to_string(number) + " is not above the newest, " +
                         std::to_string(last));
    }
    return add(events.end(), made(fields, number));
}

int EventLog::insert(const Fields& fields, const EventPlace& place) {
    check(fields);
    return add(positionOf(place), made(fields, numberIn(fields, last)));
}

bool EventLog::take(const EventAnswer& answer) {
    std::vector<const ListedEvent*> fresh;
    for (const ListedEvent& event : answer.events) {
        const bool known = std::ranges::any_of(events, [&](const Entry& entry) {
            return entry.event.sequenceNumber == event.sequenceNumber &&
                   entry.event.bytes == event.bytes;
        });
        if (!known)
            fresh.push_back(&event);
    }
    std::erase_if(events, [&](const Entry& entry) {
        return std::ranges::any_of(fresh, [&](const ListedEvent* event) {
            return event->sequenceNumber == entry.event.sequenceNumber;
        });
    });
    const auto around = std::make_shared<const EventFrame>(answer.frame);
    for (const ListedEvent* const event : fresh)
        add(events.end(), {*event, around});
    return !fresh.empty();
}

void EventLog::rollBack(int newestKept) {
    std::erase_if(events,
                  [&](const Entry& entry) { return entry.event.sequenceNumber > newestKept; });
    last = newestKept;
}

void EventLog::clear() {
    events.clear();
    last = 0;
}

std::string EventLog::body(int start, int end) const {
    const EventFrame* around = nullptr;
    std::string listed;
    for (const Entry& entry : events) {
        const auto& [number, gap, bytes] = entry.event;
        if (number < start || number > end)
            continue;
        listed.append(gap).append(bytes);
        around = entry.frame.get();
    }
    return around == nullptr ? frame->empty : around->head + listed + around->tail;
}

EventLog::Ticket EventLog::await(int lastRetrieved, Waiter waiter) {
    const auto next = std::ranges::find_if(
        events, [&](const Entry& entry) { return entry.event.sequenceNumber > lastRetrieved; });
    const Ticket ticket = nextTicket++;
    if (next != events.end()) {
        waiter(next->event.sequenceNumber);
    } else {
        waiters.emplace(ticket, Wait{lastRetrieved, std::move(waiter)});
    }
    return ticket;
}

void EventLog::wakeWaiters() {
    for (const auto& [ticket, wait] : std::exchange(waiters, {}))
        wait.waiter(wait.lastRetrieved == highest ? highest : wait.lastRetrieved + 1);
}

void EventLog::giveWaitersUp() {
    for (const auto& [ticket, wait] : std::exchange(waiters, {}))
        wait.waiter(std::nullopt);
}

EventLog::Entry EventLog::made(const Fields& fields, int sequenceNumber) {
    xml::Tree event = xml::element("o:Event");
    for (const Field& field : vocabulary) {
        const auto value = field.name == "sequenceNumber" ? std::to_string(sequenceNumber)
                                                          : valueOf(fields, field.name);
        if (value)
            xml::addText(event, "as:" + std::string(field.name), field.xsiType, *value);
    }
    return {{sequenceNumber, ownEventGap, xml::formatElement("ac:event", event, ownEventDepth)},
            ownFrame()};
}

EventLog::Entries::const_iterator EventLog::positionOf(const EventPlace& place) const {
    const auto isNeighbour = [&](const Entry& entry) {
        return entry.event.sequenceNumber == place.neighbour;
    };
    switch (place.kind) {
        case EventPlace::Kind::first:
            return events.begin();
        case EventPlace::Kind::last:
            return events.end();
        case EventPlace::Kind::before:
        case EventPlace::Kind::after:
            break;
    }
    const auto neighbour = std::ranges::find_if(events, isNeighbour);
    if (neighbour == events.end())
        throw EventError("there is no event " + std::to_string(place.neighbour));
    return place.kind == EventPlace::Kind::before ? neighbour : neighbour + 1;
}

int EventLog::add(const Entries::const_iterator& position, Entry entry) {
    const int number = entry.event.sequenceNumber;
    frame = entry.frame;
    last = position == events.end() ? number : std::max(last, number);
    entry.added = everAdded++;
    events.insert(position, std::move(entry));
    if (events.size() > capacity)
        events.erase(std::ranges::min_element(events, {}, &Entry::added));
    release(number);
    return number;
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
