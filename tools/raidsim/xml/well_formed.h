#pragma once

#include <string_view>

namespace raidsim::xml {

// Throws XmlError, naming the line, for a text that is not one well-formed document: tags that
// do not match, unknown references, forbidden characters, anything beside the one root element.
// Also refuses document types and elements nested deeper than bounds::elementNesting, so that
// what passes may be handled by recursion.
void checkWellFormed(std::string_view text);

}  // namespace raidsim::xml
