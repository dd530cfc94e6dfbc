#pragma once

#include <string>
#include <type_traits>
#include <utility>

#include "xml/tree.h"

namespace raidsim::generate {

// Builds one element, field by field.
class Element {
public:
    explicit Element(const std::string& xsiType) : tree(xml::element(xsiType)) {}
    Element(const Element&) = default;
    Element& operator=(const Element&) = default;
    // A tree can be swapped, but not moved.
    Element(Element&& other) noexcept { tree.swap(other.tree); }
    Element& operator=(Element&& other) noexcept {
        tree.swap(other.tree);
        return *this;
    }
    ~Element() = default;

    Element& number(const char* field, int value) {
        return add(field, "xsd:int", std::to_string(value));
    }
    template <typename Code>
    requires std::is_enum_v<Code> Element& number(const char* field, Code code) {
        return number(field, static_cast<int>(code));
    }
    Element& text(const char* field, const std::string& value) {
        return add(field, "xsd:string", value);
    }
    Element& flag(const char* field, bool value) {
        return add(field, "xsd:boolean", value ? "true" : "false");
    }
    Element& child(const char* name, Element made) {
        xml::addChild(tree, name).swap(made.tree);
        return *this;
    }
    [[nodiscard]] xml::Tree& get() { return tree; }

private:
    Element& add(const char* field, const char* xsiType, const std::string& value) {
        xml::addText(tree, std::string("as:") + field, xsiType, value);
        return *this;
    }

    xml::Tree tree;
};

}  // namespace raidsim::generate
