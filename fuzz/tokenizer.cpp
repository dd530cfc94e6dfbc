// Holds both uses of the tokenizer, the public unit and the readers' views, and its trace against a
// literal state machine, unit by unit through the whole input.

#include <algorithm>
#include <string>
#include <vector>

#include "support/input.h"
#include "support/require.h"
#include "support/state_machine.h"
#include "xml/parse_def_unit.h"
#include "xml/unit_reader.h"

namespace {

using namespace raid;

/// Keeps the lines that the trace writes to the log.
class TraceKeeper {
public:
    static constexpr bool tracesCharacters = true;

    void character(xml::Place place, char c) {
        lines.push_back("state " + std::to_string(static_cast<int>(place)) + ", char " + c);
    }
    void text(std::string_view found) { add("CDATA ", found); }
    void tag() noexcept {}
    void opens() noexcept {}
    void closes() noexcept {}
    void element(std::string_view name) { add("element ", name); }
    void attribute(std::string_view name, std::string_view value) {
        add("Attribute: ", std::string(name).append("=").append(value));
    }

    std::vector<std::string> lines;

private:
    void add(const char* start, std::string_view rest) {
        lines.push_back(std::string(start).append(rest));
    }
};

void requireSame(const ParseDefUnit& unit, const fuzz::DescribedUnit& described) {
    fuzz::require(unit.kind == described.kind, "kind");
    fuzz::require(unit.name == described.name, "name");
    fuzz::require(unit.attributes == described.attributes, "attributes");
    fuzz::require(unit.opening == described.opening, "opening");
    fuzz::require(unit.closing == described.closing, "closing");
    fuzz::require(unit.consumed == described.consumed, "consumed");
}

void requireSame(const xml::Unit& unit, const fuzz::DescribedUnit& described) {
    fuzz::require(unit.isTag == (described.kind == 1), "kind of a view");
    fuzz::require(unit.name == described.name, "name of a view");
    fuzz::require(unit.opening == described.opening, "opening of a view");
    fuzz::require(unit.closing == described.closing, "closing of a view");
    fuzz::require(unit.finished == (described.consumed != 0), "end of a view");
    std::string type;
    for (const auto& [name, value] : described.attributes) {
        type = name == "xsi:type" ? value : type;
    }
    fuzz::require(unit.type == type, "type of a view");
}

int requireSameUnit(std::string_view rest) {
    const auto described = fuzz::describedUnit(rest);
    const auto length = static_cast<int>(rest.size());
    requireSame(ParseDefUnit(rest.data(), length), described);
    xml::UnitReader units(rest.data(), length);
    requireSame(units.next(), described);
    fuzz::require(units.consumed() == described.consumed, "consumed of a view");
    TraceKeeper trace;
    fuzz::require(xml::Scan(rest, trace).run() == described.consumed, "consumed with the trace");
    fuzz::require(trace.lines == described.trace, "trace");
    return described.consumed;
}

}  // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::vector<char> bytes(data, data + size);  // so that every overrun is seen
    std::string_view rest(bytes.data(), bytes.size());
    while (const int consumed = requireSameUnit(rest)) {
        rest.remove_prefix(static_cast<std::size_t>(consumed));
    }
    return 0;
}
