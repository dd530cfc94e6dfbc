#include "xml/elements.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <utility>

namespace raidsim::xml {

namespace {

// Past the ">" of a tag; one in the value of an attribute does not count.
std::size_t endOfTag(std::string_view text, std::size_t at) {
    char quote = '\0';
    for (; quote != '\0' || text[at] != '>'; ++at) {
        const char c = text[at];
        if (c == quote) {
            quote = '\0';
        } else if (quote == '\0' && (c == '"' || c == '\'')) {
            quote = c;
        }
    }
    return at + 1;
}

// Past the end of what begins with this "<".
std::size_t endOfMarkup(std::string_view text, std::size_t at) {
    constexpr std::array<std::pair<std::string_view, std::string_view>, 3> brackets{{
        {"<!--", "-->"},
        {"<![CDATA[", "]]>"},
        {"<?", "?>"},
    }};
    for (const auto& [opening, closing] : brackets) {
        if (text.substr(at).starts_with(opening))
            return text.find(closing, at + opening.size()) + closing.size();
    }
    return endOfTag(text, at);
}

bool hasName(std::string_view tag, std::string_view name) {
    tag.remove_prefix(tag.starts_with("</") ? 2 : 1);
    return tag.starts_with(name) && tag.find_first_of(" \t\r\n/>") == name.size();
}

}  // namespace

std::vector<std::string_view> elementsOf(std::string_view wellFormed, std::string_view name) {
    std::vector<std::string_view> found;
    std::size_t start = 0;
    std::size_t open = 0;  // of that name
    std::size_t at = wellFormed.find('<');
    while (at != std::string_view::npos) {
        const std::size_t end = endOfMarkup(wellFormed, at);
        const std::string_view markup = wellFormed.substr(at, end - at);
        if (hasName(markup, name)) {
            if (markup.starts_with("</")) {
                --open;
            } else {
                start = open == 0 ? at : start;
                open += markup.ends_with("/>") ? 0U : 1U;
            }
            if (open == 0)
                found.push_back(wellFormed.substr(start, end - start));
        }
        at = wellFormed.find('<', end);
    }
    return found;
}

}  // namespace raidsim::xml
