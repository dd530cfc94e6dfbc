#pragma once

namespace raidinfo {

/// The whole program; returns its exit status.
[[nodiscard]] int runProgram(int argc, const char* const* argv);

}  // namespace raidinfo
