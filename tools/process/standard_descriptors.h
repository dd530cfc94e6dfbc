#pragma once

namespace process {

// Opens the null device in place of a standard input and a standard error that are closed, which
// the next file or socket would otherwise take the place of: complaints would be written into it. A
// closed standard output stays closed, since who asked for output must learn that there is none.
// For the beginning of main().
void fillStandardDescriptors() noexcept;

}  // namespace process
