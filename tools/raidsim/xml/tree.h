#pragma once

#include <boost/property_tree/ptree.hpp>
#include <stdexcept>
#include <string>
#include <string_view>
#include <utility>

namespace raidsim::xml {

// An element: its text is the data, its child elements stand in document order under their
// prefixed names, its attributes under attributesKey. A document is a Tree with one child.
using Tree = boost::property_tree::ptree;

inline constexpr const char* attributesKey = "<xmlattr>";

class XmlError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// Reads a whole well-formed document; comments are dropped. Throws XmlError.
[[nodiscard]] Tree parse(std::string_view text);

enum class Layout {
    indented,  // an element a line, two blanks a level
    compact    // all in one line
};

// Writes a document with its prolog. Only the characters that must be escaped are; an empty
// element is written as a start tag and an end tag.
[[nodiscard]] std::string format(const Tree& document, Layout layout = Layout::indented);

// Writes one element as it stands that many levels deep in an indented document, from its first "<"
// to its last ">".
[[nodiscard]] std::string formatElement(const std::string& name, const Tree& element,
                                        std::size_t depth);

[[nodiscard]] Tree element(const std::string& xsiType);
void addAttribute(Tree& element, const std::string& name, const std::string& value);
Tree& addChild(Tree& parent, const std::string& name, const Tree& child = {});

// A simple child with its xsi:type ("xsd:int", "xsd:string", "xsd:boolean").
void addText(Tree& parent, const std::string& name, const std::string& xsiType,
             const std::string& value);

// The first child of that name, or null.
[[nodiscard]] const Tree* childOf(const Tree& parent, const std::string& name);
[[nodiscard]] Tree* childOf(Tree& parent, const std::string& name);

// The text of the first child of that name, empty when there is none.
[[nodiscard]] std::string textOf(const Tree& parent, const std::string& name);

[[nodiscard]] std::string_view localName(std::string_view name) noexcept;

}  // namespace raidsim::xml
