#pragma once

#include <cstddef>
#include <cstdint>
#include <deque>
#include <map>
#include <optional>
#include <utility>
#include <vector>

#include "inventory/records.h"

namespace raidinfo {

/// Numbers of events that did not come, both ends included.
struct MissingNumbers {
    std::int64_t first;
    std::int64_t last;
    bool operator==(const MissingNumbers&) const = default;
};

/// The last event of an earlier run: its number and, if it is known, what identifies its content.
struct LastShown {
    std::int64_t number = 0;
    std::optional<std::uint64_t> content = std::nullopt;
    bool operator==(const LastShown&) const = default;
};

/// The same for the same event in every build.
[[nodiscard]] std::uint64_t contentOf(const Record& event);

/// Keeps account of the sequence numbers, so that every event is shown once and it is known which
/// never came. The library may publish a batch again, and the service may send events twice, late,
/// in disorder or, after a restart, with numbers that it has used before.
class Continuity {
public:
    /// Begins at this number; at whatever comes first where it is 0, for no event has that.
    explicit Continuity(std::int64_t first) : expected{first} {}

    /// Goes on after what an earlier run has shown.
    [[nodiscard]] static Continuity after(const LastShown& last);

    struct Accepted {
        std::vector<std::size_t> fresh;       ///< places in the batch, by their numbers
        std::vector<MissingNumbers> missing;  ///< what the batch passes over
    };
    [[nodiscard]] Accepted accept(const Records& batch);

    /// Whether a batch tells of the events that were shown, as far as it has their numbers.
    enum class History : std::uint8_t { unknown, same, different };
    [[nodiscard]] History compared(const Records& batch) const;

    /// The service counts anew: everything that it has is asked for.
    void beginAnew();

    /// The service has the same events as before, but none above this number.
    void shrinkTo(std::int64_t number);

    /// There is nothing below this number, although there are events from it on; until the service
    /// has none that far.
    void passOverTo(std::int64_t number) { asked = number; }
    void heedNewest(std::int64_t newest) { asked = asked > newest ? 0 : asked; }

    /// The least number that is ahead.
    [[nodiscard]] std::int64_t next() const noexcept;

    /// The number to ask from when there are events ahead: together with them come the last one
    /// shown, by which a service that counts anew is noticed, and those missing a short while.
    [[nodiscard]] std::int64_t overlapping() const;

    /// Whether a number is missing that may still come with the next batch.
    [[nodiscard]] bool waitsForLateEvents() const { return overlapping() < last().value_or(0); }

    /// The greatest number shown.
    [[nodiscard]] std::optional<std::int64_t> last() const noexcept { return greatest; }

private:
    [[nodiscard]] bool isFresh(std::int64_t number, std::uint64_t content);
    [[nodiscard]] bool takeFromMissing(std::int64_t number);
    void remember(std::int64_t number, std::uint64_t content);

    /// An event by its number and content; the service may use a number twice.
    using Event = std::pair<std::int64_t, std::uint64_t>;

    std::int64_t expected;   ///< the least number that is ahead
    std::int64_t asked = 0;  ///< numbers below were asked for in vain
    std::optional<std::int64_t> greatest;
    std::map<std::int64_t, std::int64_t> missingUntil;  ///< last missing by first missing
    std::map<Event, int> shown;  ///< and in which of the service's counts it was seen last
    std::deque<Event> order;     ///< of `shown`, oldest first
    int count = 0;               ///< of the times that the service began to count
};

}  // namespace raidinfo
