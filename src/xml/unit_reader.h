#pragma once

#include <algorithm>
#include <iterator>
#include <optional>
#include <string_view>

#include "diag/log.h"
#include "xml/bytes.h"
#include "xml/tag_memory.h"
#include "xml/unit.h"

namespace raid::xml {

/// A document read unit by unit. There is one way to read units, next(); the others find the same
/// units sooner where a document is written as the service writes it, and leave everything else,
/// and every document that is traced, to next().
class UnitReader {
public:
    UnitReader(const char* text, int length) noexcept
        : start(text), at(text), end(text + std::max(length, 0)) {}

    /// The next unit. An unfinished unit is returned again and again: the reader stays before it.
    Unit next() {
        before = at;
        Unit unit;
        UnitSink sink(unit);
        const int consumed = readUnit(at, remaining(), sink);
        unit.finished = consumed != 0;
        at += consumed;
        return unit;
    }

    /// The unit that was read last once more, which shows in the trace alone.
    Unit again(const Unit& last) {
        if (!traced) {
            return last;
        }
        at = before;
        return next();
    }

    /// What the document has shown of the tags inside the elements of a class.
    TagMemory& tagsOf(const Names& names) { return memories.of(names); }

    /// The next unit and the number of its name. The reference holds until the next call.
    const NamedUnit& next(TagMemory& tags) {
        if (at < plainEnd) {
            if (*at != '<') {
                passSpaceBeforeTag();
            }
            if (const auto* const tag = tags.recall({at, between(at, end)})) {
                at += tag->bytes.size();
                return tag->found;
            }
        }
        return readNamed(tags);
    }

    /// The rest of a simple element, text and end tag, where it comes in its plainest form: returns
    /// the text, empty when there is only space.
    std::optional<std::string_view> plainText(std::string_view endTag) noexcept {
        const char* const stop = findTag(at, end);
        if (plainEnd - stop < std::ssize(endTag) || !standsAt(stop, endTag)) {
            return std::nullopt;
        }
        const auto text = trimmed({at, between(at, stop)});
        at = stop + endTag.size();
        return text;
    }

    [[nodiscard]] bool isTraced() const noexcept { return traced; }
    [[nodiscard]] int consumed() const noexcept { return static_cast<int>(at - start); }
    [[nodiscard]] const char* position() const noexcept { return at; }
    [[nodiscard]] int remaining() const noexcept { return static_cast<int>(end - at); }

    /// Levels of self-containing elements around the current one.
    int nesting = 0;

private:
    // Kept out of the loops over children, which are short without them.
    void passSpaceBeforeTag() noexcept;
    const NamedUnit& readNamed(TagMemory& tags);

    const char* start;
    const char* at;
    const char* before = nullptr;  // the unit that was read last
    const char* end;
    // Asked once, since it is of interest at every unit.
    bool traced = diag::passes(diag::readingLevel);
    // How far the plain forms are looked for: where a document is traced, nowhere.
    const char* plainEnd = traced ? start : end;
    TagMemories memories;
    NamedUnit current;
};

}  // namespace raid::xml
