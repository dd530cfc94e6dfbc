#pragma once

#include <cstdint>
#include <string_view>
#include <vector>

namespace raidinfo::redact {

/// A stretch of a document: a tag, the text up to the next one, or what begins a comment, a CDATA
/// section, a declaration or an instruction, whose content is text here.
struct Piece {
    enum class Form : std::uint8_t { text, startTag, emptyTag, endTag, opening };

    Form form;
    std::string_view bytes;
    std::string_view name = {};  ///< of a tag, with its prefix
};

/// Cuts a document into pieces, which put together are the document again, however malformed it is.
/// A tag ends with its ">". Where that is missing, before the next "<" or at the end of the
/// document, the tag ends with its last whole attribute: what is left is text, so that no text
/// hides in a tag that is broken.
[[nodiscard]] std::vector<Piece> cutUp(std::string_view document);

}  // namespace raidinfo::redact
