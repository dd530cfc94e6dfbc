#include <pugixml.hpp>

#include "readers/reader.h"
#include "readers/tree_reader.h"

namespace raid::bench {
namespace {

class Node {
public:
    explicit Node(pugi::xml_node parsed) : node(parsed) {}

    [[nodiscard]] std::string_view name() const { return node.name(); }
    [[nodiscard]] std::string_view text() const { return node.child_value(); }
    [[nodiscard]] std::string_view type() const { return node.attribute("xsi:type").value(); }
    template <class Use>
    void eachElement(Use use) const {
        for (auto child = node.first_child(); child; child = child.next_sibling()) {
            if (child.type() == pugi::node_element) {
                use(Node(child));
            }
        }
    }

private:
    pugi::xml_node node;
};

}  // namespace

void readWithPugixml(agent::Document document, int length) {
    // In place, nothing decoded, and texts without nodes of their own.
    constexpr unsigned flags = pugi::parse_minimal | pugi::parse_embed_pcdata;
    pugi::xml_document parsed;
    if (!parsed.load_buffer_inplace(document.get(), static_cast<std::size_t>(length), flags,
                                    pugi::encoding_utf8)) {
        throw PeerError("malformed");
    }
    readDocument(Node(parsed));
}

}  // namespace raid::bench
