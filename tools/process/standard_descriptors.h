#pragma once

namespace process {

// Opens the null device in place of the standard descriptors that are closed, which the next files
// or sockets would otherwise take the place of: what the program says would be written into them.
// In place of a standard output it refuses to be written, since who asked for output must learn
// that there is none. For the beginning of main().
void fillStandardDescriptors() noexcept;

}  // namespace process
