#pragma once

#include <string_view>

namespace raid::test {

// Whether the header has ended, and as much body has come as it announces.
[[nodiscard]] bool isWholeRequest(std::string_view request);

}  // namespace raid::test
