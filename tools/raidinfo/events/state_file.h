#pragma once

#include <cstdint>
#include <filesystem>
#include <optional>

namespace raidinfo {

/// The file in which `events` keeps the last number that it has shown.
class StateFile {
public:
    explicit StateFile(std::filesystem::path file);

    /// Nothing if there is no file yet. A file with anything but a number is a Failure.
    [[nodiscard]] std::optional<std::int64_t> read() const;

    /// Replaces the file in one step, so that whatever happens it holds the old number or the new.
    void write(std::int64_t number) const;

private:
    std::filesystem::path path;
};

}  // namespace raidinfo
