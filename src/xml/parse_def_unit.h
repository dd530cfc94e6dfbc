#pragma once

#include <string>
#include <utility>
#include <vector>

/// True for the bytes 0 to 32, 127 to 160 and 255.
[[gnu::visibility("default")]] bool isSpace(unsigned char c);

/// Whether two strings are equal but for the case of their letters. The readers compare names
/// exactly and do not use it.
[[gnu::visibility("default")]] bool ci_equal(const std::string& left, const std::string& right);

/// One unit of an agent document, cut off its front: a tag with its attributes, or a run of text
/// up to the next "<". There is no tree and no validation; prefixes are part of names, references
/// stay undecoded, and comments, CDATA sections and doctypes read as odd tags.
class [[gnu::visibility("default")]] ParseDefUnit {
public:
    /// Reads one unit, looking at no more than length bytes of the text. Throws nothing but
    /// std::bad_alloc; a unit that the text does not finish keeps consumed at 0.
    ParseDefUnit(const char* text, int length);
    ParseDefUnit(const ParseDefUnit&);
    ParseDefUnit(ParseDefUnit &&) noexcept;
    ParseDefUnit& operator=(const ParseDefUnit&);
    ParseDefUnit& operator=(ParseDefUnit&&) noexcept;
    ~ParseDefUnit();

    /// 1 for a tag, 0 for text.
    int kind = 0;

    /// The element's name as written; of text, the text without the space around it.
    std::string name;

    /// Name and value of each attribute in document order, duplicates kept.
    std::vector<std::pair<std::string, std::string>> attributes;

    /// A start tag, an empty-element tag or the "?xml" declaration.
    bool opening = false;

    /// An end tag or an empty-element tag.
    bool closing = false;

    /// Bytes of the unit: up to and with the ">" of a tag, up to the "<" that ends a text.
    int consumed = 0;
};
