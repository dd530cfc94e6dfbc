#pragma once

#include <algorithm>
#include <string>
#include <string_view>

#include "base/decimal.h"
#include "diag/log.h"
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

template <class Model>
const Child<Model>* findChild(std::string_view name) {
    const auto& children = Vocabulary<Model>::children;
    const auto* const found =
        std::ranges::find(children, name, [](const auto& child) { return child.name; });
    return found == children.end() ? nullptr : found;
}

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
    auto unit = units.next();
    if (!unit.isTag && !unit.isUnfinished()) {
        keepText(model, child, unit.name);
        unit = units.next();
    }
    const bool ends = unit.isTag && !unit.isUnfinished() && unit.closing && unit.name == child.name;
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
        if (unit.isUnfinished()) {
            throwMissingEnd(words.endWord, unit);
        }
        if (unit.isTag && unit.closing && !unit.opening && unit.name == words.element) {
            return;
        }
    }
}

template <class Model>
void readChildren(Model& model, UnitReader& units) {
    constexpr auto& words = Vocabulary<Model>::words;
    for (;;) {
        const auto unit = units.next();
        if (unit.isUnfinished()) {
            throwMissingEnd(words.endWord, unit);
        }
        if (unit.isTag && unit.name == words.element) {
            if (unit.closing) {
                return;
            }
            throwMissingEnd("name", unit);
        }
        const auto* const child = unit.isTag ? findChild<Model>(unit.name) : nullptr;
        if (child == nullptr) {
            throwUnknown(unit);
        }
        if (!unit.opening) {
            throwMissingEnd(words.endWord, unit);
        }
        if (child->read != nullptr) {
            child->read(model, units, unit);
        } else {
            readSimple(model, *child, units, unit);
        }
    }
}

template <class Model>
void readContent(Model& model, UnitReader& units, const Unit& start) {
    constexpr auto& words = Vocabulary<Model>::words;
    if (start.isUnfinished()) {
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
