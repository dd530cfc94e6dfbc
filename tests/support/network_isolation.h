#pragma once

#include <string>

namespace raid::test {

// The service's port is fixed, and tests run in parallel: the process moves into a network
// namespace of its own. Where that is not permitted, it waits for a lock that one test process
// holds at a time. The lock lasts as long as the process. Returns which of the two it is, for
// failure messages.
std::string isolateNetwork();

}  // namespace raid::test
