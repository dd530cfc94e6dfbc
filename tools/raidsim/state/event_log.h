#pragma once

#include <cstddef>
#include <cstdint>
#include <deque>
#include <functional>
#include <map>
#include <memory>
#include <optional>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

#include "bounds.h"
#include "state/event_answer.h"

namespace raidsim {

class EventError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// Where an event is listed.
struct EventPlace {
    enum class Kind { last, first, before, after };

    Kind kind = Kind::last;
    int neighbour = 0;  // the number of the event before or after which it stands
};

// The events of the service in the order in which it lists them, and those who wait for the next
// one. Numbers rise from 1, unless somebody says otherwise.
class EventLog {
public:
    using Fields = std::vector<std::pair<std::string, std::string>>;
    // Gets the number of the event that ended the wait, or nothing when the wait was given up.
    using Waiter = std::function<void(std::optional<int> sequenceNumber)>;
    using Ticket = std::uint64_t;

    explicit EventLog(std::size_t eventsKept = bounds::eventsKept) : capacity(eventsKept) {}

    // Throws EventError for a field that an event does not have, or a number field that holds no
    // number.
    static void check(const Fields& fields);
    // The same for an event that is given no place; throws, too, for a sequenceNumber below 1.
    static void checkWithoutPlace(const Fields& fields);

    // Adds an event and calls the waiters whose wait it ends; the event that was added
    // first gives way when the log is full, wherever it is listed. Returns the event's sequence
    // number. Throws as checkWithoutPlace does, and when a given sequenceNumber is not above the
    // newest.
    int append(const Fields& fields);

    // The same at any place, and with any number. Throws as check does, and when there is no such
    // neighbour.
    int insert(const Fields& fields, const EventPlace& place);

    // Adds the events of an answer that the log does not hold yet, byte for byte; one of another
    // content gives way to the one of its number. Returns whether there were any.
    bool take(const EventAnswer& answer);

    // Forgets the events above that number, which becomes the newest; or all, as if there had never
    // been any. Those who wait go on waiting.
    void rollBack(int newestKept);
    void clear();

    // The number from which the next one is counted: that of the event that was added at the end
    // last, or of one elsewhere that is above it. 0 while there was no event.
    [[nodiscard]] int newest() const noexcept { return last; }
    [[nodiscard]] std::size_t size() const noexcept { return events.size(); }

    // The body of the getEvents answer for the kept events from start to end inclusive.
    [[nodiscard]] std::string body(int start, int end) const;

    // Calls the waiter once, with the first listed event above lastRetrieved: now or when it is
    // added. A ticket is only good for cancel; waiters run on the thread that appends.
    Ticket await(int lastRetrieved, Waiter waiter);
    void cancel(Ticket ticket) noexcept { waiters.erase(ticket); }
    [[nodiscard]] std::size_t waiting() const noexcept { return waiters.size(); }

    // Ends every wait as if the next number were there; gives every wait up.
    void wakeWaiters();
    void giveWaitersUp();

private:
    using Frame = std::shared_ptr<const EventFrame>;

    struct Entry {
        ListedEvent event;
        Frame frame;
        std::uint64_t added = 0;  // how many were added before it
    };
    struct Wait {
        int lastRetrieved;
        Waiter waiter;
    };
    using Entries = std::deque<Entry>;

    static const Frame& ownFrame();
    [[nodiscard]] static Entry made(const Fields& fields, int sequenceNumber);
    [[nodiscard]] Entries::const_iterator positionOf(const EventPlace& place) const;
    int add(const Entries::const_iterator& position, Entry entry);
    void release(int sequenceNumber);

    std::size_t capacity;
    Entries events;
    Frame frame = ownFrame();  // that of the newest event
    int last = 0;
    std::uint64_t everAdded = 0;
    std::map<Ticket, Wait> waiters;
    Ticket nextTicket = 1;
};

}  // namespace raidsim
