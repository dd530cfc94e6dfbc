#pragma once

#include <string>
#include <string_view>

#include "xml/tree.h"

namespace raidsim {

// The configuration document: an answer body with an ac:system in it.
class Document {
public:
    // Takes a whole answer body or a bare ac:system element, which is wrapped. Throws XmlError.
    static Document parse(std::string_view text);
    static Document read(const std::string& path);

    // The body of the getConfig answer; rendered once after each change.
    [[nodiscard]] const std::string& body() const;

    [[nodiscard]] const xml::Tree& system() const;

    // For changes: drops the rendered body.
    [[nodiscard]] xml::Tree& edit();

    [[nodiscard]] std::string systemName() const { return xml::textOf(system(), "as:name"); }

private:
    explicit Document(const xml::Tree& wrapped) : tree(wrapped) {}

    xml::Tree tree;
    mutable std::string rendered;
};

}  // namespace raidsim
