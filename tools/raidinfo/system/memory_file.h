#pragma once

#include <string>
#include <string_view>

#include "system/descriptor.h"

namespace raidinfo {

/// A file that is nowhere but in memory, for those who want to read one. Read from its beginning.
class MemoryFile {
public:
    explicit MemoryFile(std::string_view content);

    [[nodiscard]] int descriptor() const noexcept { return file.get(); }

    /// A path by which this process can open it.
    [[nodiscard]] std::string path() const;

private:
    Descriptor file;
};

}  // namespace raidinfo
