#pragma once

#include <gtest/gtest.h>

#include <filesystem>

namespace raid::test {

// A private directory with "run" and "logs"; the process works in "run", as a host of the library
// does. Removed, with all it holds, at the end.
class WorkDirectory {
public:
    WorkDirectory();
    WorkDirectory(const WorkDirectory&) = delete;
    WorkDirectory& operator=(const WorkDirectory&) = delete;
    ~WorkDirectory();

    // Makes both directories empty and goes back to "run".
    void reset() const;

private:
    std::filesystem::path start;
    std::filesystem::path root;
};

// Resets the directory before every test, so that tests of one process do not see each other's
// files.
class WorkDirectoryReset : public testing::EmptyTestEventListener {
public:
    explicit WorkDirectoryReset(const WorkDirectory& toReset) : directory(toReset) {}
    void OnTestStart(const testing::TestInfo& info) override;

private:
    const WorkDirectory& directory;
};

}  // namespace raid::test
