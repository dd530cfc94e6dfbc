#pragma once

#include <cstring>
#include <string_view>

#include "xml/space.h"

namespace raid::xml {

/// Where in a unit a character stands. The numbers appear in the trace.
enum class Place : int {
    beforeUnit = 0,
    text = 1,
    afterOpen = 2,
    elementName = 3,
    insideTag = 4,
    attributeName = 5,
    afterAttributeName = 6,
    afterEquals = 7,
    doubleQuoted = 8,
    singleQuoted = 9,
    tagEnd = 10,
};

/// Cuts one unit off the front of a text. The sink is told what is found, in order:
///
///     character(Place, char)   each character before it is handled, if Sink::tracesCharacters
///     text(view)               a finished text, its ends trimmed
///     tag(), opens(), closes() the kind of tag
///     element(view)            the tag's name
///     attribute(view, view)    each attribute that got a value
template <class Sink>
class Scan {
public:
    Scan(std::string_view input, Sink& finds) noexcept
        : begin(input.data()), end(input.data() + input.size()), at(begin), sink(finds) {}

    /// The bytes of the unit; 0 when the input ends before it does.
    int run() {
        if (!skip(Place::beforeUnit, isNoSpace)) {
            return 0;
        }
        return *at == '<' ? tag() : text();
    }

private:
    static constexpr ByteSet nameEnds =
        bytesThat([](std::size_t byte) { return byte == '>' || byte == '/' || spaceBytes[byte]; });
    static constexpr ByteSet attributeNameEnds =
        bytesThat([](std::size_t byte) { return byte == '=' || spaceBytes[byte]; });

    static bool isNoSpace(char c) noexcept { return !isSpaceByte(c); }

    /// Moves to the first character that stops the place; false at the end of the input.
    template <class Stop>
    bool skip(Place place, Stop stops) {
        for (const char* here = at; here != end; ++here) {
            if constexpr (Sink::tracesCharacters) {
                sink.character(place, *here);
            }
            if (stops(*here)) {
                at = here;
                return true;
            }
        }
        at = end;
        return false;
    }

    bool skipTo(Place place, char stop) {
        if constexpr (Sink::tracesCharacters) {
            return skip(place, [stop](char c) { return c == stop; });
        } else {
            const void* const found = std::memchr(at, stop, static_cast<std::size_t>(end - at));
            at = found != nullptr ? static_cast<const char*>(found) : end;
            return found != nullptr;
        }
    }

    [[nodiscard]] std::string_view since(const char* start) const noexcept {
        return {start, static_cast<std::size_t>(at - start)};
    }

    [[nodiscard]] int throughHere() const noexcept { return static_cast<int>(at + 1 - begin); }

    int text() {
        const char* const start = at++;
        if (!skipTo(Place::text, '<')) {
            return 0;
        }
        auto found = since(start);
        while (isSpaceByte(found.back())) {
            found.remove_suffix(1);
        }
        sink.text(found);
        return static_cast<int>(at - begin);
    }

    int tag() {
        sink.tag();
        ++at;
        if (!skip(Place::afterOpen, isNoSpace)) {
            return 0;
        }
        const bool endTag = *at == '/';
        endTag ? sink.closes() : sink.opens();
        const char* const name = endTag ? at + 1 : at;
        ++at;
        if (!skip(Place::elementName, [](char c) { return contains(nameEnds, c); })) {
            return 0;
        }
        sink.element(since(name));
        switch (*at) {
            case '>':
                return throughHere();
            case '/':
                sink.closes();
                return restOfTag();
            default:
                return attributes();
        }
    }

    int attributes() {
        for (;;) {
            ++at;
            if (!skip(Place::insideTag, isNoSpace)) {
                return 0;
            }
            switch (*at) {
                case '>':
                    return throughHere();
                case '/':
                    sink.closes();
                    return restOfTag();
                case '?':
                    return restOfTag();
                default:
                    if (!attribute()) {
                        return 0;
                    }
            }
        }
    }

    /// Ends on the quote that closes the value. A name without a value swallows whatever follows
    /// it up to the next "=" and quote.
    bool attribute() {
        const char* const nameStart = at++;
        if (!skip(Place::attributeName, [](char c) { return contains(attributeNameEnds, c); })) {
            return false;
        }
        const auto name = since(nameStart);
        if (*at != '=') {
            ++at;
            if (!skipTo(Place::afterAttributeName, '=')) {
                return false;
            }
        }
        ++at;
        if (!skip(Place::afterEquals, [](char c) { return c == '"' || c == '\''; })) {
            return false;
        }
        const char quote = *at;
        const char* const valueStart = ++at;
        if (!skipTo(quote == '"' ? Place::doubleQuoted : Place::singleQuoted, quote)) {
            return false;
        }
        sink.attribute(name, since(valueStart));
        return true;
    }

    /// After a "/" or "?" nothing counts but the ">".
    int restOfTag() {
        ++at;
        return skipTo(Place::tagEnd, '>') ? throughHere() : 0;
    }

    const char* begin;
    const char* end;
    const char* at;
    Sink& sink;
};

}  // namespace raid::xml
