#pragma once

#include <filesystem>

#include "system/descriptor.h"

namespace raidinfo {

/// A new folder among the temporary files; gone with all that it holds in the end. Where it cannot
/// be made, that is a std::system_error.
class TemporaryFolder {
public:
    TemporaryFolder();
    TemporaryFolder(const TemporaryFolder&) = delete;
    TemporaryFolder& operator=(const TemporaryFolder&) = delete;
    ~TemporaryFolder();

    [[nodiscard]] const std::filesystem::path& path() const noexcept { return place; }

private:
    std::filesystem::path place;
};

/// While it lives the process works in another folder; then again in the one before, be that
/// removed meanwhile or not. Where it cannot, that is a std::system_error.
class WorkingFolder {
public:
    explicit WorkingFolder(const std::filesystem::path& folder);
    WorkingFolder(const WorkingFolder&) = delete;
    WorkingFolder& operator=(const WorkingFolder&) = delete;
    ~WorkingFolder();

private:
    Descriptor before;
};

}  // namespace raidinfo
