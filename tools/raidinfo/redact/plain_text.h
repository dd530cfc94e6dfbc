#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace raidinfo::redact {

/// A text with its references decoded, and where each of its bytes comes from.
class PlainText {
public:
    explicit PlainText(std::string_view written);

    [[nodiscard]] const std::string& text() const noexcept { return plain; }

    /// How the bytes from one position of the text to another were written.
    [[nodiscard]] std::string_view written(std::size_t from, std::size_t to) const {
        return source.substr(origins[from], origins[to] - origins[from]);
    }

private:
    void add(std::string_view decodedBytes, std::size_t origin);

    std::string_view source;
    std::string plain;
    std::vector<std::size_t> origins;  ///< one more for the end
};

}  // namespace raidinfo::redact
