#include <rapidxml/rapidxml.hpp>

#include "readers/reader.h"
#include "readers/tree_reader.h"

namespace raid::bench {
namespace {

class Node {
public:
    explicit Node(const rapidxml::xml_node<char>* parsed) : node(parsed) {}

    [[nodiscard]] std::string_view name() const { return {node->name(), node->name_size()}; }
    [[nodiscard]] std::string_view text() const { return {node->value(), node->value_size()}; }
    [[nodiscard]] std::string_view type() const {
        constexpr std::string_view wanted = "xsi:type";
        const auto* const found = node->first_attribute(wanted.data(), wanted.size());
        return found == nullptr ? std::string_view()
                                : std::string_view(found->value(), found->value_size());
    }
    template <class Use>
    void eachElement(Use use) const {
        for (const auto* child = node->first_node(); child != nullptr;
             child = child->next_sibling()) {
            use(Node(child));
        }
    }

private:
    const rapidxml::xml_node<char>* node;
};

}  // namespace

void readWithRapidxml(agent::Document document, int /*length*/) {
    // The least that keeps the outcomes: nothing is decoded or terminated, texts have no nodes of
    // their own, and end tags are looked at.
    constexpr int flags = rapidxml::parse_non_destructive | rapidxml::parse_no_data_nodes |
                          rapidxml::parse_validate_closing_tags;
    rapidxml::xml_document<char> parsed;
    parsed.parse<flags>(document.get());
    readDocument(Node(&parsed));
}

}  // namespace raid::bench
