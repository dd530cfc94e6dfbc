#pragma once

#include <array>
#include <cstddef>
#include <optional>
#include <span>
#include <string_view>

namespace raid::agent {

/// The first bytes of an answer: the whole header and as much of the body as came with it. The
/// header is text, so nothing behind a zero byte is searched.
class FirstChunk {
public:
    static constexpr std::size_t capacity = 3024;  // the last byte is always zero

    /// Where one receive may write.
    [[nodiscard]] std::span<char> space() noexcept { return std::span(bytes).first(capacity - 1); }

    /// Tells how much one receive wrote; negative for an error.
    void received(std::ptrdiff_t count) noexcept {
        held = count > 0 ? static_cast<std::size_t>(count) : 0;
    }

    /// The chunk as zero-terminated text.
    [[nodiscard]] const char* text() const noexcept { return bytes.data(); }

    /// The digits behind "Content-Length: ", ten at most; nothing when the header is not there.
    [[nodiscard]] std::optional<std::string_view> lengthDigits() const noexcept;

    /// The body bytes that came with the header; nothing without the empty line that ends it.
    [[nodiscard]] std::optional<std::span<const char>> body() const noexcept;

private:
    std::array<char, capacity> bytes{};
    std::size_t held = 0;
};

}  // namespace raid::agent
