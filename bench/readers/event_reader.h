#pragma once

#include <string>
#include <vector>

#include "readers/peer.h"

// A reader on the events of a streaming parser: start of an element, text, end of an element.
namespace raid::bench {

/// One open element: what can be done with its children, whatever its class is.
struct OpenElement {
    struct Class {
        std::size_t (*childNumber)(std::string_view name, std::size_t expected);
        bool (*isElement)(std::size_t number);
        void (*keepText)(void* model, std::size_t number, std::string_view text);
        OpenElement (*open)(void* model, std::size_t number, std::string_view type);
    };

    const Class* of = nullptr;
    void* model = nullptr;
    std::size_t expected = 0;
};

template <class Model>
OpenElement openElement(Model& model, std::string_view type);

template <class Model>
std::size_t numberOfChild(std::string_view name, std::size_t expected) {
    if constexpr (xml::HasChildren<Model>) {
        return childNumber<Model>(name, expected);
    } else {
        return 0;
    }
}

template <class Model>
bool isChildElement(std::size_t number) {
    if constexpr (xml::HasChildren<Model>) {
        return xml::childrenOf<Model>[number].read != nullptr;
    } else {
        return false;
    }
}

template <class Model>
void keepTextOf(void* model, std::size_t number, std::string_view text) {
    if constexpr (xml::HasChildren<Model>) {
        keepChildText(*static_cast<Model*>(model), number, text);
    }
}

/// Unlike Row::keep this leaves the item open, so it is filled where it is kept.
template <class Model, class Row>
OpenElement openRow(void* model, std::string_view type) {
    auto& parent = *static_cast<Model*>(model);
    if constexpr (requires { Row::list; }) {
        return openElement(xml::Unread::appendTo(parent.*Row::list), type);
    } else if constexpr (requires { Row::member; }) {
        parent.*Row::member = xml::Unread::make<typename Row::Item>();
        return openElement(parent.*Row::member, type);
    } else if constexpr (requires { typename Row::Item; }) {
        static auto passed = xml::Unread::make<typename Row::Item>();
        return openElement(passed, type);
    } else {
        return {};
    }
}

template <class Model>
OpenElement openChild(void* model, std::size_t number, std::string_view type) {
    if constexpr (xml::HasChildren<Model>) {
        using Open = OpenElement (*)(void*, std::string_view);
        static constexpr auto opens = std::apply(
            []<class... Rows>(const Rows&...) {
                return std::array<Open, sizeof...(Rows)>{&openRow<Model, Rows>...};
            },
            xml::Vocabulary<Model>::children);
        return opens[number](model, type);
    } else {
        return {};
    }
}

template <class Model>
OpenElement openElement(Model& model, std::string_view type) {
    static constexpr OpenElement::Class of{&numberOfChild<Model>, &isChildElement<Model>,
                                           &keepTextOf<Model>, &openChild<Model>};
    model.*xml::Vocabulary<Model>::type = type;
    return {&of, &model, 0};
}

/// Takes the events of one document.
class EventReader {
public:
    EventReader() { renewPeerModel(); }

    void start(std::string_view name, std::string_view type) {
        ++depth;
        if (depth < systemDepth) {
            return;
        }
        if (depth == systemDepth) {
            open.push_back(openElement(*peerModel, type));
            return;
        }
        auto& parent = open.back();
        if (simple) {
            throw PeerError("an element in a simple one");
        }
        number = parent.of->childNumber(name, parent.expected);
        parent.expected = number + 1;
        if (parent.of->isElement(number)) {
            open.push_back(parent.of->open(parent.model, number, type));
        } else {
            simple = true;
            text.clear();
        }
    }

    void characters(std::string_view more) {
        if (simple) {
            text.append(more);
        }
    }

    void end() {
        --depth;
        if (simple) {
            open.back().of->keepText(open.back().model, number, text);
            simple = false;
        } else if (!open.empty()) {
            open.pop_back();
        }
    }

private:
    static constexpr int systemDepth = 4;  // in envelope, body and response

    std::vector<OpenElement> open;
    std::string text;
    std::size_t number = 0;
    int depth = 0;
    bool simple = false;
};

}  // namespace raid::bench
