#pragma once

#include "diag/debug.h"

// Stands before the library's own header of this name where its sources are compiled without any
// log: what a reader's trace costs while it is off is the difference.
namespace raid::diag {

inline constexpr int errorLevel = 1;
inline constexpr int agentLinkLevel = 8;
inline constexpr int readingLevel = 9;

void readSettings();

[[nodiscard]] constexpr bool passes(int /*level*/) { return false; }

[[gnu::format(printf, 2, 3)]] void log(int level, const char* format, ...);

}  // namespace raid::diag
