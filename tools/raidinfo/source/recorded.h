#pragma once

#include <filesystem>
#include <optional>
#include <string>

#include "library/library.h"
#include "recording/recording.h"
#include "source/inventory.h"

namespace raidinfo {

/// Reads the file; Failures where it cannot be read or is no recording.
[[nodiscard]] recording::Recording readRecording(const std::filesystem::path& path);

/// The inventory by the recording's last configuration that the library can read. Fails as if the
/// service had answered now: with serviceUnavailable where there is no answer, with malformedAnswer
/// where the library can read none.
[[nodiscard]] Inventory recordedInventory(const Library& library,
                                          const recording::Recording& recorded);

/// The events of an answer's body; nothing where the library cannot read it.
[[nodiscard]] std::optional<Records> eventsIn(const Library& library, RecordReader& reader,
                                              const std::string& body);

}  // namespace raidinfo
