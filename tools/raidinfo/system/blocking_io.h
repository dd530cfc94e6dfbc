#pragma once

#include <sys/types.h>

#include <span>
#include <string_view>

namespace raidinfo {

// Both go on when a signal interrupts them, unless the work that the thread does is cancelled and
// the call would only wait again; then they fail, with EINTR.

/// Returns whether all of it was written; if not, errno says why.
[[nodiscard]] bool writeAll(int file, std::string_view content);

/// Reads what is there, waiting for the first of it: as ::read.
[[nodiscard]] ssize_t readSome(int file, std::span<char> room);

}  // namespace raidinfo
