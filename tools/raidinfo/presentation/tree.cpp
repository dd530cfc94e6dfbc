#include "presentation/tree.h"

#include <map>
#include <utility>

#include "presentation/table.h"
#include "text/printable.h"

namespace raidinfo {
namespace {

/// Draws trees line by line.
class Artist {
public:
    Artist(const CodeBook& codes, const Painter& colors) : book{codes}, painter{colors} {}

    std::vector<DrawnLine> lines(const Group& roots) {
        for (const Node& root : roots.nodes) {
            drawn.push_back({&root, "", lineOf(root)});
            addBelow(root, "");
        }
        return std::move(drawn);
    }

private:
    /// What the summary says of a field; nothing about an empty text or a flag that is not set.
    std::string mention(const Kind& kind, const Field& field, const Value& value) {
        if (const bool* const flag = std::get_if<bool>(&value)) {
            return *flag ? inSentence(field.title) : "";
        }
        if (const auto* const text = std::get_if<std::string>(&value); text && text->empty()) {
            return "";
        }
        const std::string said =
            painter(shown(value, meaningOf(kind, field)), styleOf(value, &field));
        const bool needsTitle =
            std::holds_alternative<Unknown>(value) || field.shape != Shape::statusText;
        return needsTitle ? inSentence(field.title) + " " + said : said;
    }

    const CodeBook::Meaning* meaningOf(const Kind& kind, const Field& field) {
        const auto [found, isNew] = meanings.try_emplace(&field, nullptr);
        if (isNew) {
            found->second = book.find(kind.key, field.key);
        }
        return found->second;
    }

    std::string lineOf(const Node& node) {
        std::string text = node.title;
        const char* separator = ": ";
        const auto add = [&text, &separator](const std::string& said) {
            if (!said.empty()) {
                text += separator + said;
                separator = ", ";
            }
        };
        add(node.remark);
        if (node.record != nullptr && node.inFull) {
            for (std::size_t index = 0; index < node.kind->fields.size(); ++index) {
                const Field& field = node.kind->fields[index];
                if (field.summary == Summary::yes) {
                    add(mention(*node.kind, field, node.record->at(index)));
                }
            }
        }
        return text;
    }

    void addBelow(const Node& node, const std::string& margin) {
        std::vector<const Node*> children;
        for (const Group& group : node.groups) {
            for (const Node& child : group.nodes) {
                children.push_back(&child);
            }
        }
        for (const Node* const child : children) {
            const bool last = child == children.back();
            drawn.push_back({child, margin + (last ? "└─ " : "├─ "), lineOf(*child)});
            addBelow(*child, margin + (last ? "   " : "│  "));
        }
    }

    const CodeBook& book;
    const Painter& painter;
    std::vector<DrawnLine> drawn;
    std::map<const Field*, const CodeBook::Meaning*> meanings;  ///< looked up so far
};

}  // namespace

std::vector<DrawnLine> linesOf(const Group& roots, const CodeBook& book, const Painter& painter) {
    return Artist{book, painter}.lines(roots);
}

std::string drawn(const Group& roots, const CodeBook& book, const Painter& painter) {
    std::string drawing;
    for (const DrawnLine& line : linesOf(roots, book, painter)) {
        drawing.append(line.margin).append(line.text).append("\n");
    }
    return drawing.empty() ? std::string{noAdapters} + "\n" : drawing;
}

}  // namespace raidinfo
