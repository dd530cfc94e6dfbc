#pragma once

#include <algorithm>
#include <string_view>

#include "diag/log.h"
#include "xml/scan.h"

namespace raid::xml {

/// Logs what a scan finds on its way to the sink that keeps it.
template <class Kept>
class TracingSink {
public:
    static constexpr bool tracesCharacters = true;

    explicit TracingSink(Kept& keeper) noexcept : kept(keeper) {}

    void character(Place place, char c) {
        diag::log(diag::readingLevel, "state %d, char %c\n", static_cast<int>(place), c);
    }
    void text(std::string_view found) {
        kept.text(found);
        diag::log(diag::readingLevel, "CDATA %.*s\n", width(found), found.data());
    }
    void tag() { kept.tag(); }
    void opens() { kept.opens(); }
    void closes() { kept.closes(); }
    void element(std::string_view name) {
        kept.element(name);
        diag::log(diag::readingLevel, "element %.*s\n", width(name), name.data());
    }
    void attribute(std::string_view name, std::string_view value) {
        kept.attribute(name, value);
        diag::log(diag::readingLevel, "Attribute: %.*s=%.*s\n", width(name), name.data(),
                  width(value), value.data());
    }

private:
    static int width(std::string_view view) noexcept { return static_cast<int>(view.size()); }

    Kept& kept;
};

template <class Sink>
[[gnu::noinline, gnu::cold]] int readTracedUnit(std::string_view input, int length, Sink& sink) {
    diag::log(diag::readingLevel, "Enter ParseDefUnit length=%d\n", length);
    TracingSink tracing(sink);
    return Scan(input, tracing).run();
}

/// Reads one unit into the sink and returns the bytes consumed; traced when the log asks for it.
template <class Sink>
int readUnit(const char* text, int length, Sink& sink) {
    const std::string_view input(text, static_cast<std::size_t>(std::max(length, 0)));
    if (diag::passes(diag::readingLevel)) {
        return readTracedUnit(input, length, sink);
    }
    return Scan(input, sink).run();
}

/// What the readers need of a unit, as views into the document.
struct Unit {
    bool isTag = false;
    bool opening = false;
    bool closing = false;
    bool finished = false;  // or else the document ended before the unit did
    std::string_view name = {};
    std::string_view type = {};  // value of the last "xsi:type" attribute
};

/// Fills a Unit from a scan.
class UnitSink {
public:
    static constexpr bool tracesCharacters = false;

    explicit UnitSink(Unit& filled) noexcept : unit(filled) {}

    void text(std::string_view found) noexcept { unit.name = found; }
    void tag() noexcept { unit.isTag = true; }
    void opens() noexcept { unit.opening = true; }
    void closes() noexcept { unit.closing = true; }
    void element(std::string_view name) noexcept { unit.name = name; }
    void attribute(std::string_view name, std::string_view value) noexcept {
        if (name == "xsi:type") {
            unit.type = value;
        }
    }

private:
    Unit& unit;
};

}  // namespace raid::xml
