#pragma once

#include <algorithm>
#include <array>
#include <cstddef>
#include <string_view>

#include "xml/tag_memory.h"
#include "xml/vocabulary.h"

// How the service writes the tags inside an element. A document that writes them in another way is
// read all the same, only that each tag has to be seen once.
namespace raid::xml {

inline constexpr std::string_view beforeType = " xsi:type=\"";

/// The type that a simple child is written with; only the document tells that of an element.
template <class Model>
constexpr std::string_view usualType(typename Child<Model>::Kind kind) {
    using Kind = typename Child<Model>::Kind;
    switch (kind) {
        case Kind::number:
            return "xsd:int";
        case Kind::flag:
            return "xsd:boolean";
        case Kind::text:
            return "xsd:string";
        case Kind::element:
            break;
    }
    return {};
}

template <class Model>
class UsualTags {
    static constexpr auto& children = childrenOf<Model>;
    static_assert(children.size() <= 256, "the index counts so far");
    static constexpr std::string_view element = Vocabulary<Model>::words.element;

    /// Calls back with the pieces of each tag, first of all start tags, then of all end tags.
    template <class Call>
    static constexpr void forEachTag(Call call) {
        for (const auto& child : children) {
            call("<", child.name, beforeType, usualType<Model>(child.kind), "\">");
        }
        for (const auto& child : children) {
            call("</", child.name, ">");
        }
        call("</", element, ">");
    }

    static constexpr std::size_t length = [] {
        std::size_t sum = 0;
        forEachTag([&sum](auto... pieces) { sum += (std::string_view(pieces).size() + ...); });
        return sum;
    }();

    static constexpr auto text = [] {
        std::array<char, length> characters{};
        auto* to = characters.begin();
        forEachTag([&to](auto... pieces) {
            ((to = std::ranges::copy(std::string_view(pieces), to).out), ...);
        });
        return characters;
    }();

    static constexpr auto tags = [] {
        std::array<std::string_view, 2 * children.size() + 1> views{};
        std::string_view rest(text.data(), text.size());
        auto* to = views.begin();
        forEachTag([&](auto... pieces) {
            *to = rest.substr(0, (std::string_view(pieces).size() + ...));
            rest.remove_prefix(to->size());
            ++to;
        });
        return views;
    }();

    static constexpr Unit unitOf(const Child<Model>& child) {
        return {.isTag = true,
                .opening = true,
                .finished = true,
                .name = child.name,
                .type = usualType<Model>(child.kind)};
    }

public:
    static constexpr std::string_view endTagOf(std::size_t number) {
        return tags[children.size() + number];
    }

    /// The start tags of the children, as far as they are known.
    static constexpr auto beginnings = [] {
        std::array<std::string_view, children.size()> views{};
        for (std::size_t number = 0; number < children.size(); ++number) {
            const auto& child = children[number];
            const bool isWhole = !usualType<Model>(child.kind).empty();
            views[number] = isWhole
                                ? tags[number]
                                : tags[number].substr(0, 1 + child.name.size() + beforeType.size());
        }
        return views;
    }();

    /// For Names.
    static constexpr auto known = [] {
        std::array<KnownTag, children.size() + 1> made{};
        for (std::size_t number = 0; number < children.size(); ++number) {
            const auto unit = unitOf(children[number]);
            if (!unit.type.empty()) {
                made[number] = {tags[number], {unit, static_cast<int>(number)}};
            }
        }
        constexpr Unit end{.isTag = true, .closing = true, .finished = true, .name = element};
        made.back() = {tags.back(), {end, ownName}};
        return made;
    }();
};

}  // namespace raid::xml
