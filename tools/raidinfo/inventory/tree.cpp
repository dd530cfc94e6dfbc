#include "inventory/tree.h"

#include <algorithm>

namespace raidinfo {

const Value* findExtra(const Extras& extras, std::string_view key) {
    const auto found = std::ranges::find(extras, key, &Extras::value_type::first);
    return found == extras.end() ? nullptr : &found->second;
}

Value valueOf(const TreeField& field, const Node& node, std::span<const Node* const> holders) {
    if (field.holder) {
        // Enclosures stand below channels, and those below adapters.
        const auto depth = static_cast<std::size_t>(*field.holder);
        return depth < holders.size() ? Value{holders[depth]->number} : Unknown{};
    }
    const Value* const known = findExtra(node.extras, field.key);
    return known == nullptr ? Unknown{} : *known;
}

}  // namespace raidinfo
