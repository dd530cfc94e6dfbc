#pragma once

#include <filesystem>
#include <string>

#include "library/library.h"

namespace raidinfo {

/// Lets the library log its errors to a place of its own, which is beside the working directory and
/// therefore moves that, too; both are as before when it ends.
class LibraryLog {
public:
    explicit LibraryLog(const Library& library);
    LibraryLog(const LibraryLog&) = delete;
    LibraryLog& operator=(const LibraryLog&) = delete;
    ~LibraryLog();

    /// The last error of the XML reader with all that it says; "" if there is none.
    [[nodiscard]] std::string lastError() const;

private:
    std::filesystem::path before;
    std::filesystem::path folder;
    int* level;
    int levelBefore;
};

}  // namespace raidinfo
