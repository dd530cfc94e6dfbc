#pragma once

#include <cstdint>
#include <string>

namespace raidsim {

// What a file on the command line holds.
enum class FileKind : std::uint8_t { configuration, recording, scenario, fault, commands };

// Behind a complaint about a file that was taken for one kind: how to give it if its beginning
// tells that it is of another; else empty.
[[nodiscard]] std::string hintFor(const std::string& path, FileKind taken);

}  // namespace raidsim
