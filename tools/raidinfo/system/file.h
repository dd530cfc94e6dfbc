#pragma once

#include <cstddef>
#include <filesystem>
#include <string>
#include <string_view>

#include "system/descriptor.h"

namespace raidinfo {

/// Longer than any recording that is of use, and short enough for the program's memory.
constexpr std::size_t longestFile = std::size_t{256} * 1024 * 1024;

/// The whole file; one that cannot be read is a noInput Failure, one of more bytes a badInput
/// Failure.
[[nodiscard]] std::string readFile(const std::filesystem::path& path,
                                   std::size_t most = longestFile);

/// Writes the file beside its place and then moves it there, so that nobody ever sees half of it.
/// Links stay links, and the file's mode stays what it was. What is no regular file, such as a
/// pipe, is written to. What cannot be written is a cannotCreate Failure.
void replaceFile(const std::filesystem::path& path, std::string_view content);

/// Fails as replaceFile does where no file can be made beside the one to replace; changes nothing.
void checkReplaceable(const std::filesystem::path& path);

/// A new file that is good after every piece that is appended. What cannot be written is a
/// cannotCreate Failure.
class GrowingFile {
public:
    /// Replaces a file that is there.
    explicit GrowingFile(std::filesystem::path path);

    void append(std::string_view piece) const;

private:
    std::filesystem::path name;
    Descriptor file;
};

}  // namespace raidinfo
