#include "support/open_descriptors.h"

#include <atomic>
#include <filesystem>
#include <system_error>
#include <vector>

namespace raid::test {

namespace {

std::atomic<int> expectedGrowth{0};

using Descriptors = std::map<int, std::string>;

std::string describe(const Descriptors& descriptors) {
    std::string text;
    for (const auto& [number, target] : descriptors) {
        text += "\n  " + std::to_string(number) + " -> " + target;
    }
    return text;
}

}  // namespace

std::map<int, std::string> openDescriptors() {
    Descriptors open;
    // Looked up after the iteration, which has a descriptor of its own.
    std::vector<std::string> names;
    for (const auto& entry : std::filesystem::directory_iterator("/proc/self/fd")) {
        names.push_back(entry.path().filename().string());
    }
    for (const std::string& name : names) {
        std::error_code gone;
        const auto target = std::filesystem::read_symlink("/proc/self/fd/" + name, gone);
        if (!gone) {
            open.emplace(std::stoi(name), target.string());
        }
    }
    return open;
}

void expectOpenDescriptors(int count) { expectedGrowth = count; }

void OpenDescriptorCheck::OnTestStart(const testing::TestInfo& /*info*/) {
    expectedGrowth = 0;
    before = openDescriptors();
}

void OpenDescriptorCheck::OnTestEnd(const testing::TestInfo& /*info*/) {
    const Descriptors after = openDescriptors();
    EXPECT_EQ(static_cast<int>(after.size()) - static_cast<int>(before.size()), expectedGrowth)
        << "Open before the test:" << describe(before) << "\nand after it:" << describe(after);
}

}  // namespace raid::test
