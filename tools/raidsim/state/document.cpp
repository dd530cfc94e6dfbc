#include "state/document.h"

#include <array>

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

}  // namespace

Document Document::parse(std::string_view text) {
    xml::Tree tree = xml::parse(text);
    if (xml::childOf(tree, root) != nullptr)
        tree = soap::envelope(response, tree);
    if (systemOf(tree) == nullptr)
        throw xml::XmlError("there is no ac:system element, bare or in a getConfig answer");
    return Document(tree);
}

Document Document::read(const std::string& path) { return parse(readFile(path)); }

const std::string& Document::body() const {
    if (rendered.empty())
        rendered = xml::format(tree);
    return rendered;
}

const xml::Tree& Document::system() const { return *systemOf(tree); }

xml::Tree& Document::edit() {
    rendered.clear();
    return *systemOf(tree);
}

}  // namespace raidsim
