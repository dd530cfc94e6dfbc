#include "xml/tree.h"

#include <boost/property_tree/xml_parser.hpp>
#include <sstream>
#include <utility>

#include "xml/well_formed.h"

namespace raidsim::xml {

namespace {

void appendEscaped(std::string& out, std::string_view text) {
    for (const char c : text) {
        switch (c) {
            case '&':
                out += "&amp;";
                break;
            case '<':
                out += "&lt;";
                break;
            case '>':
                out += "&gt;";
                break;
            default:
                out += c;
        }
    }
}

void appendAttributes(std::string& out, const Tree& attributes) {
    for (const auto& [name, value] : attributes) {
        const char quote = value.data().find('"') == std::string::npos ? '"' : '\'';
        out.append(1, ' ').append(name).append(1, '=').append(1, quote);
        for (const char c : value.data()) {
            if (c == quote) {
                out += quote == '"' ? "&quot;" : "&apos;";
            } else {
                appendEscaped(out, std::string_view(&c, 1));
            }
        }
        out += quote;
    }
}

class Writer {
public:
    explicit Writer(Layout wanted) : layout(wanted) {}

    std::string write(const Tree& document) {
        out = "<?xml version=\"1.0\" encoding=\"utf-8\"?>";
        endLine();
        for (const auto& [name, child] : document)
            append(name, child, 0);
        return std::move(out);
    }

    std::string writeElement(const std::string& name, const Tree& element, std::size_t depth) {
        append(name, element, depth);
        return out.substr(2 * depth, out.size() - 2 * depth - 1);
    }

private:
    void append(const std::string& name, const Tree& element, std::size_t depth) {
        indent(depth);
        out.append(1, '<').append(name);
        const Tree* const attributes = childOf(element, attributesKey);
        if (attributes != nullptr)
            appendAttributes(out, *attributes);
        out += '>';
        appendEscaped(out, element.data());
        const std::size_t children = element.size() - (attributes != nullptr ? 1U : 0U);
        if (children != 0) {
            endLine();
            for (const auto& [childName, child] : element) {
                if (childName != attributesKey)
                    append(childName, child, depth + 1);
            }
            indent(depth);
        }
        out.append("</").append(name).append(1, '>');
        endLine();
    }

    void indent(std::size_t depth) {
        if (layout == Layout::indented)
            out.append(2 * depth, ' ');
    }

    void endLine() {
        if (layout == Layout::indented)
            out += '\n';
    }

    Layout layout;
    std::string out;
};

// The blanks between the children of an element arrive as its text.
void dropIndentation(Tree& element) {
    const std::string& text = element.data();
    if (!element.empty() && text.find_first_not_of(" \t\r\n") == std::string::npos)
        element.data().clear();
    for (auto& [name, child] : element)
        dropIndentation(child);
}

}  // namespace

Tree parse(std::string_view text) {
    checkWellFormed(text);
    std::istringstream in{std::string(text)};
    Tree document;
    try {
        read_xml(in, document, boost::property_tree::xml_parser::no_comments);
    } catch (const boost::property_tree::xml_parser_error& error) {
        throw XmlError("line " + std::to_string(error.line()) + ": " + error.message());
    }
    dropIndentation(document);
    return document;
}

std::string format(const Tree& document, Layout layout) { return Writer(layout).write(document); }

std::string formatElement(const std::string& name, const Tree& element, std::size_t depth) {
    return Writer(Layout::indented).writeElement(name, element, depth);
}

Tree element(const std::string& xsiType) {
    Tree made;
    addAttribute(made, "xsi:type", xsiType);
    return made;
}

void addAttribute(Tree& element, const std::string& name, const std::string& value) {
    Tree* attributes = childOf(element, attributesKey);
    if (attributes == nullptr)
        attributes = &element.push_front({attributesKey, Tree()})->second;
    attributes->push_back({name, Tree(value)});
}

Tree& addChild(Tree& parent, const std::string& name, const Tree& child) {
    return parent.push_back({name, child})->second;
}

void addText(Tree& parent, const std::string& name, const std::string& xsiType,
             const std::string& value) {
    Tree child = element(xsiType);
    child.data() = value;
    addChild(parent, name, child);
}

const Tree* childOf(const Tree& parent, const std::string& name) {
    const auto found = parent.find(name);
    return found == parent.not_found() ? nullptr : &found->second;
}

Tree* childOf(Tree& parent, const std::string& name) {
    const auto found = parent.find(name);
    return found == parent.not_found() ? nullptr : &found->second;
}

std::string textOf(const Tree& parent, const std::string& name) {
    const Tree* const child = childOf(parent, name);
    return child == nullptr ? std::string() : child->data();
}

std::string_view localName(std::string_view name) noexcept {
    const auto colon = name.find(':');
    return colon == std::string_view::npos ? name : name.substr(colon + 1);
}

}  // namespace raidsim::xml
