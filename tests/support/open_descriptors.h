#pragma once

#include <gtest/gtest.h>

#include <map>
#include <string>

namespace raid::test {

// The descriptors of this process, and what they are open for.
[[nodiscard]] std::map<int, std::string> openDescriptors();

// Says that the running test leaves this many descriptors open, by design.
void expectOpenDescriptors(int count);

// Fails every test that ends with more or fewer descriptors than it began with.
class OpenDescriptorCheck : public testing::EmptyTestEventListener {
public:
    void OnTestStart(const testing::TestInfo& info) override;
    void OnTestEnd(const testing::TestInfo& info) override;

private:
    std::map<int, std::string> before;
};

}  // namespace raid::test
