#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <exception>
#include <iostream>
#include <memory>
#include <string>
#include <utility>

#include "support/network_isolation.h"
#include "support/open_descriptors.h"
#include "support/work_directory.h"

namespace {

using namespace raid::test;

// Adds to a failed test how it was kept apart from the tests that ran beside it.
class IsolationNote : public testing::EmptyTestEventListener {
public:
    explicit IsolationNote(std::string kind) : isolation(std::move(kind)) {}

    void OnTestEnd(const testing::TestInfo& info) override {
        if (info.result()->Failed()) {
            std::cout << "The test ran with " << isolation << ".\n";
        }
    }

private:
    std::string isolation;
};

int runIsolated() {
    const std::string isolation = isolateNetwork();
    const WorkDirectory directory;
    // GoogleTest owns its listeners; the end of a test reaches them last to first.
    testing::TestEventListeners& listeners = testing::UnitTest::GetInstance()->listeners();
    listeners.Append(std::make_unique<IsolationNote>(isolation).release());
    listeners.Append(std::make_unique<WorkDirectoryReset>(directory).release());
    listeners.Append(std::make_unique<OpenDescriptorCheck>().release());
    return RUN_ALL_TESTS();
}

}  // namespace

int main(int argc, char** argv) {
    try {
        testing::InitGoogleMock(&argc, argv);
        return GTEST_FLAG_GET(list_tests) ? RUN_ALL_TESTS() : runIsolated();
    } catch (const std::exception& error) {
        std::cerr << error.what() << '\n';
        return 1;
    }
}
