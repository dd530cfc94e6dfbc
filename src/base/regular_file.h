#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>
#include <string>

#include "base/file_descriptor.h"

namespace raid::base {

/// A regular file opened for reading. Anything else that can stand at a path (a directory, a
/// device, a pipe that nobody writes to) is refused, so that reading never blocks the host.
class RegularFile {
public:
    [[nodiscard]] static std::optional<RegularFile> open(const std::string& path);

    [[nodiscard]] std::uint64_t size() const noexcept { return bytes; }

    /// Fills the buffer from the file's current position; returns the bytes read, which are fewer
    /// only at the end of the file or on a read error.
    std::size_t read(std::span<char> buffer) const noexcept;

private:
    RegularFile(FileDescriptor opened, std::uint64_t sizeThen) noexcept
        : file(std::move(opened)), bytes(sizeThen) {}

    FileDescriptor file;
    std::uint64_t bytes;
};

}  // namespace raid::base
