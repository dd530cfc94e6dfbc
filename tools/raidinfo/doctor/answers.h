#pragma once

#include <stop_token>

#include "doctor/examined.h"
#include "library/library.h"

namespace raidinfo {

// What the service answers to one question, as the library reads it. An answer that did not come
// before `over` was requested to stop is none within the --timeout. The library has read its
// settings.

[[nodiscard]] Examined examinedNewestEvent(const Library& library, const std::stop_token& over);
[[nodiscard]] Examined examinedConfiguration(const Library& library, const std::stop_token& over);

/// Of the events from the newest on, which examinedNewestEvent has asked for.
[[nodiscard]] Examined examinedEvents(const Library& library, const std::stop_token& over);

}  // namespace raidinfo
