#pragma once

#include <stop_token>
#include <string>
#include <string_view>

namespace raidinfo {

/// Runs the shell command with this input and waits for its end; once stop is requested it is told
/// to end (SIGTERM). Returns "" if it ended with status 0, and otherwise what went wrong.
[[nodiscard]] std::string runHook(const std::string& command, std::string_view input,
                                  const std::stop_token& stop);

}  // namespace raidinfo
