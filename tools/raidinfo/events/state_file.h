#pragma once

#include <filesystem>
#include <optional>

#include "events/continuity.h"

namespace raidinfo {

/// The file in which `events` keeps the last event that it has shown: its number, and what
/// identifies its content.
class StateFile {
public:
    explicit StateFile(std::filesystem::path file);

    /// Nothing if there is no file yet. A file with anything else is a Failure.
    [[nodiscard]] std::optional<LastShown> read() const;

    /// Replaces the file in one step, so that whatever happens it holds the old event or the new.
    /// A link stays, and what it leads to is replaced.
    void write(const LastShown& last) const;

    /// Fails as write does, and changes nothing.
    void tryToWrite() const;

private:
    std::filesystem::path path;
};

}  // namespace raidinfo
