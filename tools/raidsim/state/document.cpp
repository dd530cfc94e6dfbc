#include "state/document.h"

#include <array>
#include <utility>

#include "files.h"
#include "soap/envelope.h"

namespace raidsim {

namespace {

constexpr const char* response = "m:getConfigResponse";
constexpr const char* root = "ac:system";

constexpr std::array<const char*, 4> pathToSystem{"env:Envelope", "env:Body", response, root};

// Null when the document is not a getConfig answer.
template <typename TreeType>
TreeType* systemOf(TreeType& document) {
    TreeType* at = &document;
    for (const char* const name : pathToSystem) {
        at = xml::childOf(*at, name);
        if (at == nullptr)
            return nullptr;
    }
    return at;
}

xml::Tree parseAnswer(std::string_view text) {
    xml::Tree tree = xml::parse(text);
    if (xml::childOf(tree, root) != nullptr)
        tree = soap::envelope(response, std::move(tree));
    if (systemOf(tree) == nullptr)
        throw xml::XmlError("there is no ac:system element, bare or in a getConfig answer");
    return tree;
}

}  // namespace

Document Document::parse(std::string_view text) {
    Document made;
    made.tree = parseAnswer(text);
    return made;
}

Document Document::read(const std::string& path) { return parse(readFile(path)); }

Document Document::verbatim(std::string bytes) {
    Document made;
    made.original = std::move(bytes);
    made.rendered = made.original;
    return made;
}

const std::string& Document::body() const {
    if (rendered.empty() && tree) {
        // An edit that changed nothing, or was taken back, leaves verbatim bytes as they were.
        const bool unchanged = !original.empty() && parseAnswer(original) == *tree;
        rendered = unchanged ? original : xml::format(*tree);
    }
    return rendered;
}

xml::Tree& Document::parsed() const {
    if (!tree)
        tree = parseAnswer(original);
    return *systemOf(*tree);
}

const xml::Tree& Document::system() const { return parsed(); }

xml::Tree& Document::edit() {
    xml::Tree& system = parsed();
    rendered.clear();
    return system;
}

std::string Document::systemName() const {
    try {
        return xml::textOf(system(), "as:name");
    } catch (const xml::XmlError&) {
        return {};
    }
}

}  // namespace raidsim
