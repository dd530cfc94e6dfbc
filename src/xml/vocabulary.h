#pragma once

#include <algorithm>
#include <array>
#include <atomic>
#include <string>
#include <string_view>
#include <tuple>
#include <type_traits>
#include <utility>
#include <vector>

#include "xml/blank.h"
#include "xml/unit_reader.h"

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
///     children       its vocabulary, a tuple with one row a child; an element without it is passed
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
struct Each {
    using Model = typename MemberOf<List>::Model;
    static constexpr auto list = List;

    template <class Read>
    static void keep(Model& parent, Read read) {
        auto& items = parent.*list;
        if (items.capacity() == 0) {
            items.reserve(std::min(usualLength.load(std::memory_order_relaxed), mostReserved));
        }
        read(Unread::appendTo(items));
        usualLength.store(items.size(), std::memory_order_relaxed);
    }

    // Lists of one kind are mostly as long as the one before, also that of the refresh before.
    static inline std::atomic<std::size_t> usualLength = 0;
    // What a long list makes a short one waste is bounded.
    static constexpr std::size_t mostReserved = 64;

    std::string_view name;
};

/// An element that is kept whole; a later one replaces it.
template <auto Member>
struct One {
    using Model = typename MemberOf<Member>::Model;
    using Item = typename MemberOf<Member>::Type;
    static constexpr auto member = Member;

    template <class Read>
    static void keep(Model& parent, Read read) {
        auto item = Unread::make<Item>();
        read(item);
        parent.*member = std::move(item);
    }

    std::string_view name;
};

/// An element that must be well-formed and is not kept.
template <class OfModel, class OfItem>
struct Passed {
    using Model = OfModel;
    using Item = OfItem;

    template <class Read>
    static void keep(Model& /*parent*/, Read read) {
        auto item = Unread::make<Item>();
        read(item);
    }

    std::string_view name;
};

template <auto List>
constexpr Each<List> each(std::string_view name) {
    return {name};
}

template <auto Member>
constexpr One<Member> one(std::string_view name) {
    return {name};
}

template <class Model, class Item>
constexpr Passed<Model, Item> passed(std::string_view name) {
    return {name};
}

// What the loop that reads elements makes of the rows.

template <class Model>
constexpr Child<Model> asChild(const Child<Model>& row) {
    return row;
}

template <class Row>
constexpr Child<typename Row::Model> asChild(const Row& row) {
    return {.name = row.name,
            .read = [](typename Row::Model& parent, UnitReader& units, const Unit& start) {
                Row::keep(parent, [&](auto& item) { readElement(item, units, start); });
            }};
}

template <class Model>
inline constexpr auto childrenOf = std::apply(
    [](const auto&... rows) { return std::array{asChild(rows)...}; }, Vocabulary<Model>::children);

}  // namespace raid::xml
