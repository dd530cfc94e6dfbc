#include "redact/plain_text.h"

#include <algorithm>
#include <cctype>

#include "text/decoded.h"

namespace raidinfo::redact {
namespace {

bool belongsToReference(char c) {
    return c == '#' || std::isalnum(static_cast<unsigned char>(c)) != 0;
}

/// The reference that a text begins with; empty where there is none. Everything else, also bytes
/// that are not UTF-8, stays what it is, so that texts that differ are not taken for one.
std::string_view firstReference(std::string_view text) {
    if (!text.starts_with('&')) {
        return {};
    }
    const auto end = std::find_if_not(text.begin() + 1, text.end(), belongsToReference);
    return end != text.end() && *end == ';'
               ? text.substr(0, static_cast<std::size_t>(end - text.begin()) + 1)
               : std::string_view{};
}

}  // namespace

PlainText::PlainText(std::string_view written) : source{written} {
    std::size_t at = 0;
    while (at < source.size()) {
        const std::string_view reference = firstReference(source.substr(at));
        const std::string character = decoded(reference);
        if (character != reference) {
            add(character, at);
            at += reference.size();
        } else {
            add(source.substr(at, 1), at);
            ++at;
        }
    }
    origins.push_back(source.size());
}

void PlainText::add(std::string_view decodedBytes, std::size_t origin) {
    plain += decodedBytes;
    origins.insert(origins.end(), decodedBytes.size(), origin);
}

}  // namespace raidinfo::redact
