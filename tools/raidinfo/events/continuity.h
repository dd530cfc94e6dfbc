#pragma once

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <deque>
#include <map>
#include <optional>
#include <vector>

#include "inventory/records.h"

namespace raidinfo {

/// Numbers of events that did not come, both ends included.
struct MissingNumbers {
    std::int64_t first;
    std::int64_t last;
    bool operator==(const MissingNumbers&) const = default;
};

/// Keeps account of the sequence numbers, so that every event is shown once and it is known which
/// never came. The library may publish a batch again, and the service may send events twice, late,
/// or, after a restart, with numbers that it has used before.
class Continuity {
public:
    /// Begins at this number; at whatever comes first where it is 0, for no event has that.
    explicit Continuity(std::int64_t first) : expected{first} {}

    /// Goes on after this number, which was shown by an earlier run.
    [[nodiscard]] static Continuity after(std::int64_t last);

    struct Accepted {
        std::vector<std::size_t> fresh;       ///< places in the batch, in the order sent
        std::vector<MissingNumbers> missing;  ///< what the batch passes over
    };
    [[nodiscard]] Accepted accept(const Records& batch);

    /// Learns the number of the service's newest event. Returns whether the service has begun to
    /// count anew; then all that it has is asked for again, and what was shown before is known by
    /// its content.
    [[nodiscard]] bool beganAnew(std::int64_t newest);

    /// The least number to ask for.
    [[nodiscard]] std::int64_t next() const noexcept { return std::max(expected, asked); }

    /// There is nothing below this number, although there are events from it on.
    void passOverTo(std::int64_t number) { asked = number; }

    /// The greatest number shown.
    [[nodiscard]] std::optional<std::int64_t> last() const noexcept { return greatest; }

private:
    [[nodiscard]] bool wasShown(std::int64_t number, const Record& event) const;
    [[nodiscard]] bool takeFromMissing(std::int64_t number);
    void remember(std::int64_t number, const Record& event);

    std::int64_t expected;   ///< the least number that is ahead
    std::int64_t asked = 0;  ///< numbers below were asked for in vain
    std::optional<std::int64_t> greatest;
    std::map<std::int64_t, std::int64_t> missingUntil;  ///< last missing by first missing
    std::map<std::int64_t, std::size_t> shown;          ///< hash of the content by number
    std::deque<std::int64_t> order;                     ///< of `shown`, oldest first
};

}  // namespace raidinfo
