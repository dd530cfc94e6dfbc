#pragma once

#include <cstdint>
#include <optional>
#include <stop_token>

#include "inventory/records.h"
#include "library/library.h"
#include "source/exchange.h"

namespace raidinfo {

/// Finds the next event behind a gap of any length. The library reads the events of a hundred
/// numbers at a time, which takes days from one end of the numbers to the other; asked here are
/// ranges that grow as long as there is nothing in them.
class GapSearch {
public:
    explicit GapSearch(const Library& searched);

    /// The least number from `first` to `last` of an event that the service has. Where there is
    /// none, the number behind `first` to go on from: what the library reads at a time holds `last`
    /// then. Nothing when it gives no answer that can be read, or stop is requested.
    [[nodiscard]] std::optional<std::int64_t> leastNumber(std::int64_t first, std::int64_t last,
                                                          const std::stop_token& stop);

private:
    const Library& library;
    RecordReader reader;
    Exchange service;
};

}  // namespace raidinfo
