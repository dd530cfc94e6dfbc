#include "xml/element_reader.h"

namespace raid::xml {

void throwMissingEnd(std::string_view endWord, const Unit& found) {
    throw RAIDXMLError("End of \"" + std::string(endWord) +
                       "\" is missing before : " + std::string(found.name));
}

void throwUnknown(const Unit& found) {
    throw RAIDXMLError("Unknown element in   : " + std::string(found.name));
}

void throwNestedTooDeep(const Unit& found) {
    throw RAIDXMLError("Nesting too deep at  : " + std::string(found.name));
}

}  // namespace raid::xml
