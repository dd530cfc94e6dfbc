#pragma once

#include <optional>
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

    // Bytes that are served as they are, well-formed or not, until they are changed.
    static Document verbatim(std::string bytes);

    // The body of the getConfig answer; rendered once after each change.
    [[nodiscard]] const std::string& body() const;

    // Throws XmlError where verbatim bytes are no document.
    [[nodiscard]] const xml::Tree& system() const;

    // For changes: drops the rendered body. Throws as system does.
    [[nodiscard]] xml::Tree& edit();

    // Empty where there is none.
    [[nodiscard]] std::string systemName() const;

private:
    Document() = default;
    [[nodiscard]] xml::Tree& parsed() const;

    mutable std::optional<xml::Tree>
        tree;              // verbatim bytes are parsed when somebody looks into them
    std::string original;  // those bytes
    mutable std::string rendered;
};

}  // namespace raidsim
