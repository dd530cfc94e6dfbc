#pragma once

#include <cstddef>

namespace raidinfo {

/// The buffer that the library's text functions write to, which know no length limit. No text is
/// longer than the answer it came in, and the length of an answer has at most nine digits; so this
/// many bytes of address space are reserved, of which only the pages written to cost memory.
class TextBuffer {
public:
    static constexpr std::size_t capacity = 1'000'000'000;

    TextBuffer();
    ~TextBuffer();
    TextBuffer(const TextBuffer&) = delete;
    TextBuffer& operator=(const TextBuffer&) = delete;

    [[nodiscard]] char* data() const noexcept { return bytes; }

private:
    char* bytes = nullptr;
};

}  // namespace raidinfo
