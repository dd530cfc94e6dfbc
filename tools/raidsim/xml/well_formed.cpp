#include "xml/well_formed.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <string>
#include <vector>

#include "bounds.h"
#include "xml/tree.h"

namespace raidsim::xml {

namespace {

constexpr std::string_view blanks = " \t\r\n";

constexpr bool startsName(char c) noexcept {
    const bool letter = (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z');
    return letter || c == '_' || c == ':' || (static_cast<unsigned char>(c) & 0x80U) != 0;
}

constexpr bool continuesName(char c) noexcept {
    return startsName(c) || (c >= '0' && c <= '9') || c == '-' || c == '.';
}

constexpr bool isForbidden(char c) noexcept {
    return static_cast<unsigned char>(c) < 0x20 && blanks.find(c) == std::string_view::npos;
}

bool isKnownReference(std::string_view name) {
    constexpr std::array<std::string_view, 5> named{"amp", "lt", "gt", "quot", "apos"};
    if (std::ranges::find(named, name) != named.end())
        return true;
    if (!name.starts_with('#'))
        return false;
    const bool hex = name.starts_with("#x");
    name.remove_prefix(hex ? 2 : 1);
    unsigned long code = 0;
    const char* const end = name.data() + name.size();
    const auto [stop, error] = std::from_chars(name.data(), end, code, hex ? 16 : 10);
    const bool control = code < 0x20 && code != 9 && code != 10 && code != 13;
    const bool surrogate = code >= 0xD800 && code <= 0xDFFF;
    return error == std::errc{} && stop == end && !control && !surrogate && code <= 0x10FFFF;
}

class Scanner {
public:
    explicit Scanner(std::string_view document) : text(document) {}

    void run() {
        skip("\xEF\xBB\xBF");
        while (at < text.size()) {
            if (text[at] == '<') {
                readMarkup();
            } else {
                readCharacters();
            }
        }
        if (!open.empty())
            fail("element \"" + std::string(open.back()) + "\" is not closed");
        if (!rootSeen)
            fail("there is no element");
    }

private:
    [[noreturn]] void fail(const std::string& what) const {
        const auto lines = std::ranges::count(text.substr(0, at), '\n');
        throw XmlError("line " + std::to_string(lines + 1) + ": " + what);
    }

    [[nodiscard]] bool ahead(std::string_view token) const {
        return text.substr(at).starts_with(token);
    }

    bool skip(std::string_view token) {
        if (!ahead(token))
            return false;
        at += token.size();
        return true;
    }

    void skipPast(std::string_view token, const char* what) {
        const auto end = text.find(token, at);
        if (end == std::string_view::npos)
            fail(std::string(what) + " is not closed");
        checkCharacters(text.substr(at, end - at));
        at = end + token.size();
    }

    bool skipBlanks() {
        const auto start = at;
        at = std::min(text.find_first_not_of(blanks, at), text.size());
        return at != start;
    }

    std::string_view readName() {
        const auto start = at;
        if (at < text.size() && startsName(text[at])) {
            while (at < text.size() && continuesName(text[at]))
                ++at;
        }
        if (at == start)
            fail("a name is missing");
        return text.substr(start, at - start);
    }

    void checkCharacters(std::string_view part) const {
        if (std::ranges::any_of(part, isForbidden))
            fail("a control character");
    }

    void checkReferences(std::string_view part) const {
        for (auto amp = part.find('&'); amp != std::string_view::npos; amp = part.find('&')) {
            part.remove_prefix(amp + 1);
            const auto end = part.find(';');
            if (end == std::string_view::npos || !isKnownReference(part.substr(0, end)))
                fail("an unknown reference after \"&\"");
        }
    }

    void readCharacters() {
        const auto end = std::min(text.find('<', at), text.size());
        const std::string_view part = text.substr(at, end - at);
        checkCharacters(part);
        checkReferences(part);
        if (open.empty() && part.find_first_not_of(blanks) != std::string_view::npos)
            fail("text outside of the root element");
        at = end;
    }

    void readMarkup() {
        if (skip("<?")) {
            skipPast("?>", "a processing instruction");
        } else if (skip("<!--")) {
            skipPast("-->", "a comment");
        } else if (ahead("<![CDATA[")) {
            if (open.empty())
                fail("text outside of the root element");
            skipPast("]]>", "a CDATA section");
        } else if (ahead("<!")) {
            fail("declarations are not accepted");
        } else if (skip("</")) {
            readEndTag();
        } else {
            ++at;
            readStartTag();
        }
    }

    void readEndTag() {
        const std::string_view name = readName();
        skipBlanks();
        if (!skip(">"))
            fail("the end tag of \"" + std::string(name) + "\" is not closed");
        if (open.empty() || open.back() != name) {
            fail("end tag of \"" + std::string(name) + "\" where " +
                 (open.empty() ? "no element is open"
                               : "\"" + std::string(open.back()) + "\" is open"));
        }
        open.pop_back();
    }

    void readStartTag() {
        if (open.empty() && rootSeen)
            fail("a second root element");
        rootSeen = true;
        open.push_back(readName());
        if (open.size() > bounds::elementNesting)
            fail("elements are nested too deeply");
        for (;;) {
            const bool separated = skipBlanks();
            if (skip("/>")) {
                open.pop_back();
                return;
            }
            if (skip(">"))
                return;
            if (!separated)
                fail("the tag of \"" + std::string(open.back()) + "\" is not closed");
            readAttribute();
        }
    }

    void readAttribute() {
        const std::string_view name = readName();
        skipBlanks();
        const bool assigned = skip("=");
        skipBlanks();
        const std::size_t end = assigned && (ahead("\"") || ahead("'"))
                                    ? text.find(text[at], at + 1)
                                    : std::string_view::npos;
        if (end == std::string_view::npos)
            fail("attribute \"" + std::string(name) + "\" has no quoted value");
        const std::string_view value = text.substr(at + 1, end - at - 1);
        checkCharacters(value);
        checkReferences(value);
        if (value.find('<') != std::string_view::npos)
            fail("\"<\" in the value of attribute \"" + std::string(name) + "\"");
        at = end + 1;
    }

    std::string_view text;
    std::size_t at = 0;
    bool rootSeen = false;
    std::vector<std::string_view> open;
};

}  // namespace

void checkWellFormed(std::string_view text) { Scanner(text).run(); }

}  // namespace raidsim::xml
