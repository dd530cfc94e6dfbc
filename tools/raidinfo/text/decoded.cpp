#include "text/decoded.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <utility>

#include "text/utf8.h"

namespace raidinfo {
namespace {

constexpr auto predefinedEntities = std::to_array<std::pair<std::string_view, char32_t>>({
    {"amp", U'&'},
    {"lt", U'<'},
    {"gt", U'>'},
    {"quot", U'"'},
    {"apos", U'\''},
});

/// The character that a reference stands for; `name` is what stands between "&" and ";".
std::optional<char32_t> referenced(std::string_view name) {
    if (!name.starts_with('#')) {
        const auto found = std::ranges::find(predefinedEntities, name,
                                             &std::pair<std::string_view, char32_t>::first);
        return found == predefinedEntities.end() ? std::nullopt : std::optional{found->second};
    }
    name.remove_prefix(1);
    const bool hexadecimal = name.starts_with('x');
    name.remove_prefix(hexadecimal ? 1 : 0);
    std::uint32_t value = 0;
    const char* const end = name.data() + name.size();
    const auto [stop, error] = std::from_chars(name.data(), end, value, hexadecimal ? 16 : 10);
    const bool surrogate = value >= 0xD800 && value <= 0xDFFF;
    if (error != std::errc{} || stop != end || value == 0 || value > lastCodePoint || surrogate) {
        return std::nullopt;
    }
    return value;
}

/// Longer names cannot be references that are decoded ("&#x10FFFF;" with some leading zeros).
constexpr std::size_t longestReference = 16;

}  // namespace

std::string decoded(std::string_view sent) {
    if (std::ranges::all_of(sent, [](char byte) { return byte > 0 && byte != '&'; })) {
        return std::string{sent};
    }
    std::string result;
    result.reserve(sent.size());
    while (!sent.empty()) {
        if (sent.front() == '&') {
            const std::size_t end = sent.substr(0, longestReference).find(';');
            if (end != std::string_view::npos) {
                if (const auto character = referenced(sent.substr(1, end - 1))) {
                    appendUtf8(result, *character);
                    sent.remove_prefix(end + 1);
                    continue;
                }
            }
        }
        const auto [codePoint, length] = firstCodePoint(sent);
        if (codePoint) {
            result += sent.substr(0, length);
        } else {
            appendUtf8(result, replacementCharacter);
        }
        sent.remove_prefix(length);
    }
    return result;
}

}  // namespace raidinfo
