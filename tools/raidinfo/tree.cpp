#include "tree.h"

#include <cctype>

#include "table.h"

namespace raidinfo {
namespace {

/// A title inside a sentence: "Physical slot" begins small, "SMART error" stays.
std::string inSentence(std::string_view title) {
    const auto isUpper = [title](std::size_t index) {
        return index < title.size() && std::isupper(static_cast<unsigned char>(title[index])) != 0;
    };
    std::string result{title};
    if (isUpper(0) && !isUpper(1)) {
        result[0] = static_cast<char>(std::tolower(static_cast<unsigned char>(result[0])));
    }
    return result;
}

/// What the summary says of a field; nothing about an empty text or a flag that is not set.
std::string mention(const Field& field, const Value& value) {
    if (const bool* const flag = std::get_if<bool>(&value)) {
        return *flag ? inSentence(field.title) : "";
    }
    if (const auto* const text = std::get_if<std::string>(&value); text && text->empty()) {
        return "";
    }
    if (std::holds_alternative<UnknownStatus>(value) || field.shape != Shape::statusText) {
        return inSentence(field.title) + " " + shown(value);
    }
    return shown(value);
}

std::string line(const Node& node) {
    std::string mentions;
    const auto add = [&mentions](const std::string& text) {
        if (!text.empty()) {
            mentions += (mentions.empty() ? ": " : ", ") + text;
        }
    };
    add(node.remark);
    if (node.record != nullptr && node.inFull) {
        for (std::size_t index = 0; index < node.kind->fields.size(); ++index) {
            const Field& field = node.kind->fields[index];
            if (field.summary == Summary::yes) {
                add(mention(field, node.record->at(index)));
            }
        }
    }
    return node.title + mentions + "\n";
}

void drawBelow(const Node& node, const std::string& margin, std::string& drawing) {
    std::vector<const Node*> children;
    for (const Group& group : node.groups) {
        for (const Node& child : group.nodes) {
            children.push_back(&child);
        }
    }
    for (const Node* const child : children) {
        const bool last = child == children.back();
        drawing += margin + (last ? "└─ " : "├─ ") + line(*child);
        drawBelow(*child, margin + (last ? "   " : "│  "), drawing);
    }
}

}  // namespace

std::string drawn(const Group& roots) {
    std::string drawing;
    for (const Node& root : roots.nodes) {
        drawing += line(root);
        drawBelow(root, "", drawing);
    }
    return drawing.empty() ? "No adapters\n" : drawing;
}

}  // namespace raidinfo
