#pragma once

#include <string>
#include <vector>

// Values in a tagged byte buffer, for callers; the library does not use them. Each function writes
// little-endian 32-bit words at the buffer, without alignment, and returns the position behind what
// it wrote. The caller provides the room: 8 bytes and what is said below.

#pragma GCC visibility push(default)

/// Tag 0, the value.
void* packI(void* buffer, int value);

/// Tag 1, the length, the bytes of the string, a zero byte: length + 1 bytes more. Of a string that
/// holds a zero byte only the bytes before it are copied, though the whole length is recorded and
/// passed.
void* packS(void* buffer, std::string value);

/// Tag 2, the count, each integer packed.
void* packAI(void* buffer, std::vector<int> values);

/// Tag 3, the count, each string packed.
void* packAS(void* buffer, std::vector<std::string> values);

#pragma GCC visibility pop
