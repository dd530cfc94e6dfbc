#include "support/second_opinion.h"

#include <libxml/parser.h>
#include <libxml/tree.h>

#include <algorithm>
#include <climits>
#include <cstdlib>
#include <memory>
#include <string_view>

#include "model/event_classes.h"

namespace raid::fuzz {
namespace {

using test::Kind;
using test::ModelClass;
using test::Reading;

struct FreeDocument {
    void operator()(xmlDoc* document) const noexcept { xmlFreeDoc(document); }
};

/// Thrown for a document on which the two readers may differ.
struct Undecided {};

std::string text(const xmlChar* chars) {
    return chars == nullptr
               ? std::string()
               : std::string(static_cast<const char*>(static_cast<const void*>(chars)));
}

template <class Node>
std::string nameOf(const Node* node) {
    const bool prefixed = node->ns != nullptr && node->ns->prefix != nullptr;
    return (prefixed ? text(node->ns->prefix) + ":" : std::string()) + text(node->name);
}

std::string attribute(const xmlNode* node, std::string_view name) {
    for (const auto* at = node->properties; at != nullptr; at = at->next) {
        if (nameOf(at) == name) {
            return at->children == nullptr ? std::string() : text(at->children->content);
        }
    }
    return {};
}

/// The reader trims bytes, not characters.
std::string trimmed(std::string value) {
    const auto isSpaceByte = [](char byte) {
        const auto c = static_cast<unsigned char>(byte);
        return c <= 32 || (c >= 127 && c <= 160) || c == 255;
    };
    value.erase(value.begin(), std::ranges::find_if_not(value, isSpaceByte));
    while (!value.empty() && isSpaceByte(value.back())) {
        value.pop_back();
    }
    return value;
}

const ModelClass* find(const std::vector<ModelClass>& classes, const std::string& element) {
    const auto found = std::ranges::find(classes, element, &ModelClass::element);
    return found == classes.end() ? nullptr : &*found;
}

const ModelClass* classOf(const std::string& element) {
    const auto* found = find(test::modelClasses(), element);
    return found != nullptr ? found : find(test::eventClasses(), element);
}

std::string shownAs(Kind kind, const std::string& value) {
    switch (kind) {
        case Kind::number:
            return std::to_string(std::clamp(std::strtoll(value.c_str(), nullptr, 10),
                                             static_cast<long long>(INT_MIN),
                                             static_cast<long long>(INT_MAX)));
        case Kind::flag:
            return value == "true" ? "1" : "0";
        case Kind::text:
            break;
    }
    return value;
}

bool holds(const xmlNode* node, const std::string& name) {
    return node != nullptr && ((node->type == XML_ELEMENT_NODE && nameOf(node) == name) ||
                               holds(node->children, name) || holds(node->next, name));
}

Reading passedOver(const xmlNode* node) {
    if (holds(node->children, nameOf(node))) {
        throw Undecided();
    }
    return {.type = attribute(node, "xsi:type")};
}

std::optional<Reading> read(const ModelClass& model, const xmlNode* node);

/// Reads the children of one element into what is known of it.
class Children {
public:
    Children(const ModelClass& described, Reading& filled) : model(described), reading(filled) {}

    /// False when the vocabulary forbids the child.
    bool take(const xmlNode* child) {
        if (child->type == XML_TEXT_NODE) {
            return trimmed(text(child->content)).empty();
        }
        if (child->type != XML_ELEMENT_NODE) {
            throw Undecided();
        }
        const auto name = nameOf(child);
        if (name == model.element) {
            throw Undecided();
        }
        return takeField(child, name) || takeElement(child, name) || takeUnshown(child, name);
    }

private:
    static std::optional<std::string> textIn(const xmlNode* node) {
        std::string all;
        for (const auto* at = node->children; at != nullptr; at = at->next) {
            if (at->type != XML_TEXT_NODE) {
                return std::nullopt;
            }
            all += text(at->content);
        }
        return trimmed(all);
    }

    bool takeField(const xmlNode* child, const std::string& name) {
        for (std::size_t i = 0; i < model.fields.size(); ++i) {
            if ("as:" + model.fields[i].name == name) {
                const auto value = textIn(child);
                if (value && !value->empty()) {
                    reading.values[i] = shownAs(model.fields[i].kind, *value);
                }
                return value.has_value();
            }
        }
        return false;
    }

    bool takeElement(const xmlNode* child, const std::string& name) {
        for (std::size_t i = 0; i < model.inside.size(); ++i) {
            const auto& [path, single] = model.inside[i];
            if (path.front() != name) {
                continue;
            }
            const auto* const inner = classOf(name);
            const auto item = inner != nullptr ? read(*inner, child) : passedOver(child);
            if (!item) {
                return false;
            }
            if (path.size() > 1) {
                reading.inside[i] = item->inside.front();
            } else if (single) {
                reading.inside[i] = {*item};
            } else {
                reading.inside[i].push_back(*item);
            }
            return true;
        }
        return false;
    }

    bool takeUnshown(const xmlNode* child, const std::string& name) const {
        if (std::ranges::find(model.unshown, name) == model.unshown.end()) {
            return false;
        }
        if (name.starts_with("as:")) {
            return textIn(child).has_value();
        }
        (void)passedOver(child);
        return true;
    }

    const ModelClass& model;
    Reading& reading;
};

std::optional<Reading> read(const ModelClass& model, const xmlNode* node) {
    Reading reading = model.read("<" + model.element + "/>");  // for the start values
    reading.type = attribute(node, "xsi:type");
    Children children(model, reading);
    for (const auto* child = node->children; child != nullptr; child = child->next) {
        if (!children.take(child)) {
            return std::nullopt;
        }
    }
    return reading;
}

bool usesWhatTheReaderDoesNotKnow(const std::string& document) {
    return !document.starts_with('<') || document.find('\0') != std::string::npos ||
           document.find_first_of("&\r\t") != std::string::npos ||
           document.find("<!") != std::string::npos || document.find("<?") != std::string::npos;
}

}  // namespace

std::optional<Opinion> secondOpinion(const std::string& document) {
    if (usesWhatTheReaderDoesNotKnow(document)) {
        return std::nullopt;
    }
    constexpr int options =
        XML_PARSE_NONET | XML_PARSE_NOERROR | XML_PARSE_NOWARNING | XML_PARSE_HUGE;
    const std::unique_ptr<xmlDoc, FreeDocument> parsed(xmlReadMemory(
        document.data(), static_cast<int>(document.size()), nullptr, nullptr, options));
    const auto* const root = parsed ? xmlDocGetRootElement(parsed.get()) : nullptr;
    const auto* const model = root != nullptr ? classOf(nameOf(root)) : nullptr;
    if (model == nullptr) {
        return std::nullopt;
    }
    try {
        return Opinion{model, read(*model, root)};
    } catch (const Undecided&) {
        return std::nullopt;
    }
}

}  // namespace raid::fuzz
