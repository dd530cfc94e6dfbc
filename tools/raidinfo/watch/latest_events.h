#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "events/continuity.h"

namespace raidinfo {

/// The lines of the latest events that came while somebody watched.
class LatestEvents {
public:
    /// The number from which to wait for events where this is the service's newest one. What came
    /// while the inventory was read is waited for, too, and the newest itself where the numbers
    /// went back.
    [[nodiscard]] std::int64_t awaited(std::int64_t newest) const;

    /// The number from which to read once those are there: with the last one seen right before
    /// them, since another event may use its number once more.
    [[nodiscard]] std::int64_t readFrom(std::int64_t awaitedNumber) const;

    /// Keeps those that are new; returns whether there are any.
    bool take(const Records& batch, std::int64_t newest);

    /// The latest last.
    [[nodiscard]] const std::vector<std::string>& lines() const noexcept { return latest; }

private:
    std::optional<Continuity> continuity;  ///< from the first batch on
    std::vector<std::string> latest;
};

}  // namespace raidinfo
