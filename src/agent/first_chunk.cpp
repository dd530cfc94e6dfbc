#include "agent/first_chunk.h"

#include <algorithm>

namespace raid::agent {
namespace {

constexpr std::string_view lengthName = "Content-Length: ";
constexpr std::string_view headerEnd = "\n\n";  // the service ends its lines with a bare LF
constexpr std::size_t mostDigits = 10;

}  // namespace

std::optional<std::string_view> FirstChunk::lengthDigits() const noexcept {
    const std::string_view header = text();
    const auto found = header.find(lengthName);
    if (found == std::string_view::npos) {
        return std::nullopt;
    }
    const auto value = header.substr(found + lengthName.size(), mostDigits);
    return value.substr(0, value.find_first_not_of("0123456789"));
}

std::optional<std::span<const char>> FirstChunk::body() const noexcept {
    const auto found = std::string_view(text()).find(headerEnd);
    if (found == std::string_view::npos) {
        return std::nullopt;
    }
    return std::span(bytes).first(held).subspan(found + headerEnd.size());
}

}  // namespace raid::agent
