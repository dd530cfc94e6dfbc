#pragma once

#include <algorithm>
#include <array>
#include <string>
#include <string_view>

#include "base/decimal.h"
#include "diag/log.h"
#include "xml/name_index.h"
#include "xml/raid_xml_error.h"
#include "xml/vocabulary.h"

namespace raid::xml {

[[noreturn]] void throwMissingEnd(std::string_view endWord, const Unit& found);
[[noreturn]] void throwUnknown(const Unit& found);
[[noreturn]] void throwNestedTooDeep(const Unit& found);

inline void traceLine(const char* line) {
    if (diag::passes(diag::readingLevel)) {
        debug(diag::readingLevel, line);
    }
}

/// Counts an element that can contain itself, so that a document cannot exhaust the host's stack.
class NestingGuard {
public:
    NestingGuard(UnitReader& reader, int limit, const Unit& start) : units(reader) {
        if (units.nesting == limit) {
            throwNestedTooDeep(start);
        }
        ++units.nesting;
    }
    NestingGuard(const NestingGuard&) = delete;
    NestingGuard& operator=(const NestingGuard&) = delete;
    ~NestingGuard() { --units.nesting; }

private:
    UnitReader& units;
};

// What a name is to a class that is not one of its children.
inline constexpr int ownName = -1;
inline constexpr int unknownName = -2;

/// The names of the children, and the element's own behind them.
template <class Model>
inline constexpr auto indexOf = [] {
    constexpr auto& children = childrenOf<Model>;
    std::array<std::string_view, children.size() + 1> names;
    std::ranges::transform(children, names.begin(), [](const auto& child) { return child.name; });
    names.back() = Vocabulary<Model>::words.element;
    return NameIndex(names);
}();

/// The row of the child, or what else the name is to the class.
template <class Model>
int numberOf(std::string_view name) {
    constexpr auto count = childrenOf<Model>.size();
    const auto place = indexOf<Model>.find(name);
    if (place < count) {
        return static_cast<int>(place);
    }
    return place == count ? ownName : unknownName;
}

template <class Model>
inline constexpr Names namesOf{&numberOf<Model>, seedOf(Vocabulary<Model>::words.element)};

template <class Model>
void keepText(Model& model, const Child<Model>& child, std::string_view text) {
    switch (child.kind) {
        case Child<Model>::Kind::number:
            model.*child.number = base::decimalNumber(text);
            break;
        case Child<Model>::Kind::flag:
            model.*child.number = text == "true" ? 1 : 0;
            break;
        case Child<Model>::Kind::text:
            model.*child.text = text;
            break;
        case Child<Model>::Kind::element:
            break;
    }
}

/// An element without text, written either way, leaves the member as it was.
template <class Model>
void readSimple(Model& model, const Child<Model>& child, UnitReader& units, const Unit& start) {
    if (start.closing) {
        return;
    }
    if (const auto plain = units.plainText(child.name)) {
        if (!plain->empty()) {
            keepText(model, child, *plain);
        }
        return;
    }
    auto unit = units.next();
    if (!unit.isTag && unit.finished) {
        keepText(model, child, unit.name);
        unit = units.next();
    }
    const bool ends = unit.isTag && unit.finished && unit.closing && unit.name == child.name;
    if (!ends) {
        throwMissingEnd(child.endWord, unit);
    }
}

template <class Model>
concept HasChildren = requires {
    Vocabulary<Model>::children;
};

template <class Model>
concept NestsInItself = requires {
    Vocabulary<Model>::nestingLimit;
};

/// Passes over everything up to the element's end tag.
template <class Model>
void passOver(UnitReader& units) {
    constexpr auto& words = Vocabulary<Model>::words;
    for (;;) {
        const auto unit = units.next();
        if (!unit.finished) {
            throwMissingEnd(words.endWord, unit);
        }
        if (unit.isTag && unit.closing && !unit.opening && unit.name == words.element) {
            return;
        }
    }
}

/// Anything but the start of a known child must be the element's own end.
template <class Model>
void requireEnd(const NamedUnit& found) {
    constexpr auto& words = Vocabulary<Model>::words;
    const auto& [unit, number] = found;
    if (!unit.finished) {
        throwMissingEnd(words.endWord, unit);
    }
    if (!unit.isTag || number == unknownName) {
        throwUnknown(unit);
    }
    if (number != ownName) {
        throwMissingEnd(words.endWord, unit);
    }
    if (!unit.closing) {
        throwMissingEnd("name", unit);
    }
}

template <class Model>
void readChildren(Model& model, UnitReader& units) {
    while (!units.passEnd(Vocabulary<Model>::words.element)) {
        const auto& found = units.next(namesOf<Model>);
        const auto& [unit, number] = found;
        if (number < 0 || !unit.opening || !unit.finished) {
            requireEnd<Model>(found);
            return;
        }
        const auto& child = childrenOf<Model>[static_cast<std::size_t>(number)];
        if (child.read != nullptr) {
            child.read(model, units, unit);
        } else {
            readSimple(model, child, units, unit);
        }
    }
}

template <class Model>
void readContent(Model& model, UnitReader& units, const Unit& start) {
    constexpr auto& words = Vocabulary<Model>::words;
    if (!start.finished) {
        throwMissingEnd(words.endWord, start);
    }
    if (!start.isTag || !start.opening || start.name != words.element) {
        throwUnknown(start);
    }
    model.*Vocabulary<Model>::type = start.type;
    if (start.closing) {
        return;
    }
    if constexpr (NestsInItself<Model>) {
        const NestingGuard guard(units, Vocabulary<Model>::nestingLimit, start);
        readChildren(model, units);
    } else if constexpr (HasChildren<Model>) {
        readChildren(model, units);
    } else {
        passOver<Model>(units);
    }
}

/// The frame around every element: its lines in the trace, and its line in the message of an
/// error inside it.
template <class Model, class Read>
void tracedReading(Model& model, Read read) {
    constexpr auto& words = Vocabulary<Model>::words;
    traceLine(words.entry);
    try {
        read();
    } catch (RAIDXMLError& error) {
        processException(words.context,
                         words.detail == nullptr ? std::string() : model.*words.detail, error);
    }
    traceLine(words.exit);
}

/// What the parent has looked at to choose this reader, the reader reads for itself.
template <class Model>
void readElement(Model& model, UnitReader& units, const Unit& start) {
    tracedReading(model, [&] { readContent(model, units, units.again(start)); });
}

/// What a public reading constructor does: reads the element that the text begins with and reports
/// the bytes up to the end of its end tag.
template <class Model>
void readElement(Model& model, const char* text, int length, int* consumed) {
    UnitReader units(text, length);
    tracedReading(model, [&] { readContent(model, units, units.next()); });
    if (consumed != nullptr) {
        *consumed = units.consumed();
    }
}

}  // namespace raid::xml
