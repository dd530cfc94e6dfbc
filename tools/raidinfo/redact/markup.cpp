#include "redact/markup.h"

#include <algorithm>
#include <array>
#include <cstddef>

#include "xml/space.h"

namespace raidinfo::redact {
namespace {

using raid::xml::isSpaceByte;
using Form = Piece::Form;

/// The longer ones first.
constexpr auto openings = std::to_array<std::string_view>({"<![CDATA[", "<!--", "<!", "<?"});

std::size_t nameLength(std::string_view name, std::string_view behind);

/// Cuts the tag that a text begins with.
class TagCutter {
public:
    explicit TagCutter(std::string_view beginning) : text{beginning} {}

    Piece cut() {
        passSpace();
        const bool isEndTag = stands('/');
        if (isEndTag) {
            ++at;
            passSpace();
        }
        const std::size_t nameStart = at;
        passWord("/>");
        if (at == nameStart) {
            return {Form::opening, text.substr(0, at)};
        }
        if (!isEndTag && isOver()) {
            at = nameStart + nameLength(text.substr(nameStart, at - nameStart), text.substr(at));
        }
        const std::string_view name = text.substr(nameStart, at - nameStart);
        passAttributes();
        const std::string_view bytes = text.substr(0, end);
        if (isEndTag) {
            return {Form::endTag, bytes, name};
        }
        return {bytes.ends_with("/>") ? Form::emptyTag : Form::startTag, bytes, name};
    }

private:
    [[nodiscard]] bool isOver() const { return at == text.size() || text[at] == '<'; }
    [[nodiscard]] bool stands(char wanted) const { return !isOver() && text[at] == wanted; }

    void passSpace() {
        while (!isOver() && isSpaceByte(text[at])) {
            ++at;
        }
    }

    void passWord(std::string_view stops) {
        while (!isOver() && !isSpaceByte(text[at]) &&
               stops.find(text[at]) == std::string_view::npos) {
            ++at;
        }
    }

    /// Finds the end of the tag.
    void passAttributes() {
        end = at;
        for (passSpace(); !isOver(); passSpace()) {
            if (stands('>')) {
                end = at + 1;
                return;
            }
            if (!passAttribute()) {
                return;
            }
        }
    }

    /// A name with a value, or a stray slash or word; false when the value's quote is missing.
    bool passAttribute() {
        if (stands('/')) {
            ++at;
            return true;
        }
        passWord("=/>");
        passSpace();
        if (!stands('=')) {
            return true;
        }
        ++at;
        passSpace();
        return !(stands('"') || stands('\'')) || passQuoted();
    }

    bool passQuoted() {
        const char quote = text[at];
        const std::size_t open = at;
        do {
            ++at;
        } while (!isOver() && text[at] != quote);
        if (!isOver()) {
            end = ++at;
            return true;
        }
        const std::size_t tagEnd = text.substr(0, at).find('>', open);
        if (tagEnd != std::string_view::npos) {
            end = tagEnd + 1;
        }
        return false;
    }

    std::string_view text;
    std::size_t at = 1;
    std::size_t end = 1;
};

/// The length of the name of a tag whose ">" is missing, so that the text may run on from it: the
/// end tag behind it tells where the name ends.
std::size_t nameLength(std::string_view name, std::string_view behind) {
    const Piece next = behind.starts_with("</") ? TagCutter{behind}.cut() : Piece{};
    const bool runsOn = !next.name.empty() && name.starts_with(next.name);
    return runsOn ? next.name.size() : name.size();
}

Piece firstPiece(std::string_view document) {
    if (document.front() != '<') {
        return {Form::text, document.substr(0, document.find('<'))};
    }
    const auto opening = std::ranges::find_if(
        openings, [document](std::string_view text) { return document.starts_with(text); });
    return opening != openings.end() ? Piece{Form::opening, document.substr(0, opening->size())}
                                     : TagCutter{document}.cut();
}

}  // namespace

std::vector<Piece> cutUp(std::string_view document) {
    std::vector<Piece> pieces;
    while (!document.empty()) {
        pieces.push_back(firstPiece(document));
        document.remove_prefix(pieces.back().bytes.size());
    }
    return pieces;
}

}  // namespace raidinfo::redact
