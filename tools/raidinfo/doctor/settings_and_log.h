#pragma once

#include "doctor/examined.h"
#include "library/library.h"

namespace raidinfo {

/// Lets the library read its settings, once for all: it does so with its first message.
void readSettings(const Library& library);

/// Where the settings file is looked for, what stands there, and the level that the library has.
[[nodiscard]] Examined examinedSettings(const Library& library);

/// Where the log is, and whether it can be written.
[[nodiscard]] Examined examinedLog(const Library& library);

}  // namespace raidinfo
