#pragma once

#include <cstddef>
#include <cstdint>
#include <deque>
#include <functional>
#include <map>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

#include "bounds.h"
#include "xml/tree.h"

namespace raidsim {

class EventError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// The events of the service, numbered upwards from 1, and those who wait for the next one.
class EventLog {
public:
    using Fields = std::vector<std::pair<std::string, std::string>>;
    using Waiter = std::function<void(int sequenceNumber)>;
    using Ticket = std::uint64_t;

    explicit EventLog(std::size_t eventsKept = bounds::eventsKept) : capacity(eventsKept) {}

    // Throws EventError for a field that an event does not have, a number field that holds no
    // number, or a sequenceNumber that is not above the newest.
    static void check(const Fields& fields);

    // Adds an event and calls the waiters whose wait it ends; the oldest event gives way when
    // the log is full. Returns the event's sequence number.
    int append(const Fields& fields);

    // 0 while there was no event.
    [[nodiscard]] int newest() const noexcept { return last; }
    [[nodiscard]] std::size_t size() const noexcept { return events.size(); }

    // The body of the getEvents answer for the kept events from start to end inclusive.
    [[nodiscard]] std::string body(int start, int end) const;

    // Calls the waiter once, with the first kept event above lastRetrieved: now or when it is
    // added. A ticket is only good for cancel; waiters run on the thread that appends.
    Ticket await(int lastRetrieved, Waiter waiter);
    void cancel(Ticket ticket) noexcept { waiters.erase(ticket); }
    [[nodiscard]] std::size_t waiting() const noexcept { return waiters.size(); }

private:
    struct Entry {
        int sequenceNumber;
        xml::Tree event;
    };
    struct Wait {
        int lastRetrieved;
        Waiter waiter;
    };

    void release(int sequenceNumber);

    std::size_t capacity;
    std::deque<Entry> events;
    int last = 0;
    std::map<Ticket, Wait> waiters;
    Ticket nextTicket = 1;
};

}  // namespace raidsim
