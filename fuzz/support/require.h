#pragma once

#include <cstdio>
#include <cstdlib>

namespace raid::fuzz {

/// Ends the run with a finding when the condition does not hold.
inline void require(bool holds, const char* promise) {
    if (!holds) {
        std::fprintf(stderr, "Broken promise: %s\n", promise);
        std::abort();
    }
}

}  // namespace raid::fuzz
