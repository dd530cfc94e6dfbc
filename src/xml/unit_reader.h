#pragma once

#include <algorithm>
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

    /// The next unit and the number of its name. The reference holds until the next call.
    const NamedUnit& next(const Names& names) {
        if (!traced) {
            passSpaceBeforeTag();
            if (const auto* const tag = memory.recall(rest(), names)) {
                at += tag->bytes.size();
                return tag->found;
            }
        }
        return readNamed(names);
    }

    /// Passes the end tag of the element where it comes next, in its plainest form.
    bool passEnd(std::string_view element) noexcept {
        if (traced) {
            return false;
        }
        passSpaceBeforeTag();
        const bool ends = isEndAt(at, element);
        if (ends) {
            at += endTagBytes(element);
        }
        return ends;
    }

    /// The rest of a simple element, text and end tag, where it comes in its plainest form: returns
    /// the text, empty when there is only space.
    std::optional<std::string_view> plainText(std::string_view element) noexcept {
        const char* const stop = findTag(at, end);
        if (traced || !isEndAt(stop, element)) {
            return std::nullopt;
        }
        const auto text = trimmed({at, between(at, stop)});
        at = stop + endTagBytes(element);
        return text;
    }

    [[nodiscard]] int consumed() const noexcept { return static_cast<int>(at - start); }
    [[nodiscard]] const char* position() const noexcept { return at; }
    [[nodiscard]] int remaining() const noexcept { return static_cast<int>(end - at); }

    /// Levels of self-containing elements around the current one.
    int nesting = 0;

private:
    static constexpr std::size_t endTagBytes(std::string_view element) noexcept {
        return element.size() + std::string_view("</>").size();
    }

    [[nodiscard]] bool isEndAt(const char* tag, std::string_view element) const noexcept {
        return between(tag, end) >= endTagBytes(element) && tag[0] == '<' && tag[1] == '/' &&
               tag[endTagBytes(element) - 1] == '>' && standsAt(tag + 2, element);
    }

    [[nodiscard]] std::string_view rest() const noexcept { return {at, between(at, end)}; }

    void passSpaceBeforeTag() noexcept {
        if (at != end && *at != '<') {
            at = passSpace(at, end);
        }
    }

    const NamedUnit& readNamed(const Names& names);

    const char* start;
    const char* at;
    const char* before = nullptr;  // the unit that was read last
    const char* end;
    // Asked once, since it is of interest at every unit.
    bool traced = diag::passes(diag::readingLevel);
    TagMemory memory;
    NamedUnit current;
};

}  // namespace raid::xml
