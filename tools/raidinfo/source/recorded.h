#pragma once

#include <cstddef>
#include <filesystem>
#include <optional>
#include <string>

#include "library/library.h"
#include "recording/recording.h"
#include "source/inventory.h"

namespace raidinfo {

/// Reads the file; Failures where it cannot be read or is no recording.
[[nodiscard]] recording::Recording readRecording(const std::filesystem::path& path);

struct RecordedInventory {
    Inventory inventory;
    std::size_t leftOut = 0;  ///< later answers, which the library cannot read
};

/// By the recording's last configuration that the library can read. Fails as if the service had
/// answered now: with serviceUnavailable where there is no answer, with malformedAnswer where the
/// library can read none.
[[nodiscard]] RecordedInventory recordedInventory(const Library& library,
                                                  const recording::Recording& recorded);

/// Publishes the configuration of an answer's body; returns whether the library can read it.
[[nodiscard]] bool publishConfiguration(const Library& library, const std::string& body);

/// The events of an answer's body; nothing where the library cannot read it.
[[nodiscard]] std::optional<Records> eventsIn(const Library& library, RecordReader& reader,
                                              const std::string& body);

/// The answers of a recording with events, one after the other.
class RecordedEvents {
public:
    RecordedEvents(const Library& loaded, const recording::Recording& read);

    /// The events of the next answer that the library can read, which may be none; nothing at the
    /// end. A recording without such an answer fails as recordedInventory does.
    [[nodiscard]] std::optional<Records> next();

    /// How many answers were left out so far, for the library cannot read them.
    [[nodiscard]] std::size_t leftOut() const noexcept { return malformed; }

private:
    const Library& library;
    const recording::Recording& recorded;
    RecordReader reader;
    std::size_t place = 0;
    std::size_t wellFormed = 0;
    std::size_t malformed = 0;
};

}  // namespace raidinfo
