#pragma once

#include <algorithm>
#include <array>
#include <string>
#include <string_view>

#include "base/decimal.h"
#include "diag/log.h"
#include "xml/raid_xml_error.h"
#include "xml/usual_tags.h"
#include "xml/vocabulary.h"

namespace raid::xml {

[[noreturn]] void throwMissingEnd(std::string_view endWord, const Unit& found);
[[noreturn]] void throwUnknown(const Unit& found);
[[noreturn]] void throwNestedTooDeep(const Unit& found);

inline void traceLine(const UnitReader& units, const char* line) {
    if (units.isTraced()) {
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

/// The row of the child, or what else the name is to the class.
template <class Model>
int numberOf(std::string_view name) {
    constexpr auto& children = childrenOf<Model>;
    const auto child = std::ranges::find(children, name, &Child<Model>::name);
    if (child != children.end()) {
        return static_cast<int>(child - children.begin());
    }
    return name == Vocabulary<Model>::words.element ? ownName : unknownName;
}

/// What the class knows of the tags inside its element.
template <class Model>
inline constexpr Names namesOf{&numberOf<Model>, UsualTags<Model>::known,
                               TagIndex(UsualTags<Model>::beginnings)};

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

/// The rest of a simple element in any form. Rare, and so kept out of the loop around it.
template <class Model>
[[gnu::noinline]] void readAnyText(Model& model, const Child<Model>& child, UnitReader& units) {
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

/// An element without text, written either way, leaves the member as it was.
template <class Model>
void readSimple(Model& model, std::size_t number, UnitReader& units, const Unit& start) {
    if (start.closing) {
        return;
    }
    const auto& child = childrenOf<Model>[number];
    const auto plain = units.plainText(UsualTags<Model>::endTagOf(number));
    if (!plain) {
        readAnyText(model, child, units);
    } else if (!plain->empty()) {
        keepText(model, child, *plain);
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
    auto& tags = units.tagsOf(namesOf<Model>);
    for (;;) {
        const auto& found = units.next(tags);
        const auto& unit = found.unit;
        if (found.number < 0 || !unit.opening || !unit.finished) {
            requireEnd<Model>(found);
            return;
        }
        const auto number = static_cast<std::size_t>(found.number);
        if (const auto read = childrenOf<Model>[number].read) {
            read(model, units, unit);
        } else {
            readSimple(model, number, units, unit);
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
void tracedReading(Model& model, const UnitReader& units, Read read) {
    constexpr auto& words = Vocabulary<Model>::words;
    traceLine(units, words.entry);
    try {
        read();
    } catch (RAIDXMLError& error) {
        processException(words.context,
                         words.detail == nullptr ? std::string() : model.*words.detail, error);
    }
    traceLine(units, words.exit);
}

/// What the parent has looked at to choose this reader, the reader reads for itself.
template <class Model>
void readElement(Model& model, UnitReader& units, const Unit& start) {
    tracedReading(model, units, [&] { readContent(model, units, units.again(start)); });
}

/// What a public reading constructor does: reads the element that the text begins with and reports
/// the bytes up to the end of its end tag.
template <class Model>
void readElement(Model& model, const char* text, int length, int* consumed) {
    UnitReader units(text, length);
    tracedReading(model, units, [&] { readContent(model, units, units.next()); });
    if (consumed != nullptr) {
        *consumed = units.consumed();
    }
}

}  // namespace raid::xml
