#pragma once

#include <array>
#include <string>
#include <string_view>
#include <type_traits>
#include <utility>
#include <vector>

#include "model/blank.h"
#include "xml/unit.h"

namespace raid::xml {

/// One known child of an element: where its text goes, or how the child element is read. "simple"
/// children hold a text, the others are elements with a reader of their own.
template <class Model>
struct Child {
    enum class Kind { number, flag, text, element };

    std::string_view name;          // with its prefix
    std::string_view endWord = {};  // what the message about its missing end tag calls it
    Kind kind = Kind::element;
    int Model::*number = nullptr;
    std::string Model::*text = nullptr;
    void (*read)(Model& parent, UnitReader& units, const Unit& start) = nullptr;
};

/// What the trace and the messages say of an element.
template <class Model>
struct Words {
    std::string_view element;     // with its prefix
    std::string_view endWord;     // what the message about its missing end tag calls it
    const char* entry = nullptr;  // log lines
    const char* exit = nullptr;
    const char* context = "association";   // its line in the message of an error inside it
    std::string Model::*detail = nullptr;  // told after the context
};

/// Specialised for each model class, beside it, as its table:
///
///     words          what it is called
///     type           the member that keeps the "xsi:type" attribute
///     children       its vocabulary, one row a child; without it the element's content is passed
///                    over up to its own end tag
///     nestingLimit   for an element that can contain itself: how deep
template <class Model>
struct Vocabulary;

/// Reads the element whose start tag was read last. Throws RAIDXMLError for a malformed one.
template <class Model>
void readElement(Model& model, UnitReader& units, const Unit& start);

/// Makes the objects that are read next; no one else may make one of these classes unread.
struct Unread {
    template <class Item>
    static Item make() {
        if constexpr (std::is_default_constructible_v<Item>) {
            return Item();
        } else {
            return Item(Blank());
        }
    }

    template <class Item>
    static Item& appendTo(std::vector<Item>& list) {
        if constexpr (std::is_default_constructible_v<Item>) {
            return list.emplace_back();
        } else {
            return list.emplace_back(Blank());
        }
    }
};

// The rows. A simple child's message calls it by its name without the prefix, unless told another
// word.

constexpr std::string_view withoutPrefix(std::string_view name) {
    return name.substr(name.find(':') + 1);
}

/// A whole number, clamped to 32 bits.
template <class Model>
constexpr Child<Model> number(std::string_view name, int Model::*member,
                              std::string_view endWord = {}) {
    return {.name = name,
            .endWord = endWord.empty() ? withoutPrefix(name) : endWord,
            .kind = Child<Model>::Kind::number,
            .number = member};
}

/// 1 for exactly "true", 0 for any other text.
template <class Model>
constexpr Child<Model> flag(std::string_view name, int Model::*member) {
    return {.name = name,
            .endWord = withoutPrefix(name),
            .kind = Child<Model>::Kind::flag,
            .number = member};
}

template <class Model>
constexpr Child<Model> text(std::string_view name, std::string Model::*member) {
    return {.name = name,
            .endWord = withoutPrefix(name),
            .kind = Child<Model>::Kind::text,
            .text = member};
}

template <auto Member>
struct MemberOf;
template <class OfModel, class OfType, OfType OfModel::*Member>
struct MemberOf<Member> {
    using Model = OfModel;
    using Type = OfType;
};

/// An element that is appended to a list each time it occurs.
template <auto List>
constexpr auto each(std::string_view name) {
    using Model = typename MemberOf<List>::Model;
    return Child<Model>{.name = name,
                        .read = [](Model& parent, UnitReader& units, const Unit& start) {
                            readElement(Unread::appendTo(parent.*List), units, start);
                        }};
}

/// An element that is kept whole; a later one replaces it.
template <auto Member>
constexpr auto one(std::string_view name) {
    using Model = typename MemberOf<Member>::Model;
    using Item = typename MemberOf<Member>::Type;
    return Child<Model>{.name = name,
                        .read = [](Model& parent, UnitReader& units, const Unit& start) {
                            auto item = Unread::make<Item>();
                            readElement(item, units, start);
                            parent.*Member = std::move(item);
                        }};
}

/// An element that must be well-formed and is not kept.
template <class Model, class Item>
constexpr Child<Model> passed(std::string_view name) {
    return {.name = name, .read = [](Model& /*parent*/, UnitReader& units, const Unit& start) {
                auto item = Unread::make<Item>();
                readElement(item, units, start);
            }};
}

}  // namespace raid::xml
