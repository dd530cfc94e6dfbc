#pragma once

#include "readers/peer.h"

// A reader on a document object model. A Node is cheap to copy and has name(), text(), type() (the
// "xsi:type" attribute), and eachElement(use), which calls use(child) for every child element.
namespace raid::bench {

template <class Model, class Node>
void readTree(Model& model, Node node);

/// Reads the child with the number of its row, which is an element.
template <class Model, class Node>
void readChildElement(Model& model, std::size_t number, Node node) {
    using Read = void (*)(Model&, Node);
    static constexpr auto reads = std::apply(
        [](const auto&... rows) {
            const auto readOf = []<class Row>(const Row&) -> Read {
                if constexpr (!std::is_same_v<Row, xml::Child<Model>>) {
                    return [](Model& parent, Node child) {
                        Row::keep(parent, [&](auto& item) { readTree(item, child); });
                    };
                } else {
                    return nullptr;
                }
            };
            return std::array<Read, sizeof...(rows)>{readOf(rows)...};
        },
        xml::Vocabulary<Model>::children);
    reads[number](model, node);
}

template <class Model, class Node>
void readTree(Model& model, Node node) {
    model.*xml::Vocabulary<Model>::type = node.type();
    if constexpr (xml::HasChildren<Model>) {
        std::size_t expected = 0;
        node.eachElement([&](Node child) {
            const auto number = childNumber<Model>(child.name(), expected);
            expected = number + 1;
            if (xml::childrenOf<Model>[number].read != nullptr) {
                readChildElement(model, number, child);
            } else {
                keepChildText(model, number, child.text());
            }
        });
    }
}

/// Envelope, body and response stand around the system.
template <class Node>
void readDocument(Node root) {
    renewPeerModel();
    Node node = root;
    for (int level = 0; level < 4; ++level) {
        Node inner = node;
        node.eachElement([&](Node child) { inner = child; });
        node = inner;
    }
    readTree(*peerModel, node);
}

}  // namespace raid::bench
