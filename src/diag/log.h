#pragma once

#include "RAIDInstrumentation.h"
#include "base/shared_value.h"
#include "diag/debug.h"

namespace raid::diag {

inline constexpr int errorLevel = 1;
inline constexpr int agentLinkLevel = 8;
inline constexpr int readingLevel = 9;

/// Sets LOG_LEVEL from the settings file; a file that cannot be read leaves it alone.
void readSettings();

/// Whether a message of this level is written; the first question in the process reads the
/// settings. Callers ask before they format anything.
[[nodiscard]] inline bool passes(int level) {
    if (base::load(configRead) == 0) {
        readSettings();
    }
    return level <= base::load(LOG_LEVEL);
}

/// Formats a message of any length, as printf does, and hands it to debug; does neither below the
/// level.
[[gnu::format(printf, 2, 3)]] void log(int level, const char* format, ...);

}  // namespace raid::diag
