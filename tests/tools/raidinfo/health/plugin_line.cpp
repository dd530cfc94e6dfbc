#include "plugin_line.h"

#include <algorithm>
#include <array>
#include <limits>
#include <set>

namespace raidinfo::test {
namespace {

constexpr std::string_view digits = "0123456789";

class Reader {
public:
    explicit Reader(std::string_view text) : rest{text} {}

    [[nodiscard]] bool atEnd() const { return rest.empty(); }
    [[nodiscard]] bool at(std::string_view text) const { return rest.starts_with(text); }

    bool skip(std::string_view text) {
        const bool there = at(text);
        rest.remove_prefix(there ? text.size() : 0);
        return there;
    }

    void need(std::string_view text) {
        if (!skip(text)) {
            throw NoPluginLine{"no \"" + std::string{text} + "\" before \"" + std::string{rest} +
                               "\""};
        }
    }

    // At least one character, up to one of these.
    std::string until(std::string_view ends) {
        const std::string word{rest.substr(0, rest.find_first_of(ends))};
        if (word.empty()) {
            throw NoPluginLine{"nothing before \"" + std::string{rest} + "\""};
        }
        rest.remove_prefix(word.size());
        return word;
    }

    std::string number() {
        std::string text = skip("-") ? "-" : "";
        text += someDigits();
        if (skip(".")) {
            text += "." + someDigits();
        }
        return text;
    }

    [[nodiscard]] bool atNumber() const {
        return !atEnd() && (at("-") || digits.find(rest.front()) != std::string_view::npos);
    }

private:
    std::string someDigits() {
        const std::string text{rest.substr(0, rest.find_first_not_of(digits))};
        if (text.empty()) {
            throw NoPluginLine{"no number before \"" + std::string{rest} + "\""};
        }
        rest.remove_prefix(text.size());
        return text;
    }

    std::string_view rest;
};

struct Range {
    bool inside;  // alerts inside instead of outside
    double start, end;
};

std::string readRange(Reader& reader, Range& range) {
    constexpr double infinite = std::numeric_limits<double>::infinity();
    range = {reader.skip("@"), 0, infinite};
    std::string text = range.inside ? "@" : "";
    std::string first;
    if (reader.skip("~")) {
        first = "~";
    } else if (reader.atNumber()) {
        first = reader.number();
    }
    if (reader.skip(":")) {
        range.start = first == "~" ? -infinite : first.empty() ? 0 : std::stod(first);
        text += first + ":";
        first = reader.atNumber() ? reader.number() : "";
        if (text.ends_with("~:") && first.empty()) {
            throw NoPluginLine{"a range without a bound"};
        }
    }
    if (first == "~" || (text.empty() && first.empty()) || text + first == "@") {
        throw NoPluginLine{"no range"};
    }
    range.end = first.empty() ? infinite : std::stod(first);
    return text + first;
}

std::string readLabel(Reader& reader) {
    if (reader.skip("'")) {
        std::string label = reader.until("'=|");
        reader.need("'");
        return label;
    }
    return reader.until(" '=|");
}

PluginMeasurement readMeasurement(Reader& reader) {
    static const std::set<std::string> units{"s",  "ms", "us", "%",  "B",
                                             "KB", "MB", "GB", "TB", "c"};
    PluginMeasurement measured{};
    measured.label = readLabel(reader);
    reader.need("=");
    measured.value = std::stod(reader.number());
    if (!reader.atEnd() && !reader.at(";") && !reader.at(" ")) {
        measured.unit = reader.until("; ");
        if (!units.contains(measured.unit)) {
            throw NoPluginLine{"no unit: " + measured.unit};
        }
    }
    for (std::string* const threshold : {&measured.warning, &measured.critical}) {
        if (!reader.skip(";")) {
            return measured;
        }
        if (!reader.at(";") && !reader.at(" ") && !reader.atEnd()) {
            Range range{};
            *threshold = readRange(reader, range);
        }
    }
    for (std::string* const bound : {&measured.minimum, &measured.maximum}) {
        if (!reader.skip(";")) {
            return measured;
        }
        *bound = reader.atNumber() ? reader.number() : "";
    }
    return measured;
}

}  // namespace

PluginLine parsedPluginLine(std::string_view output) {
    if (!output.ends_with('\n') || output.find('\n') != output.size() - 1) {
        throw NoPluginLine{"not one line"};
    }
    Reader reader{output.substr(0, output.size() - 1)};
    PluginLine line{.service = reader.until(" "), .state = "", .text = "", .data = {}};
    reader.need(" ");
    line.state = reader.until(" ");
    constexpr auto states =
        std::to_array<std::string_view>({"OK", "WARNING", "CRITICAL", "UNKNOWN"});
    if (std::ranges::find(states, line.state) == states.end()) {
        throw NoPluginLine{"no state: " + line.state};
    }
    reader.need(" - ");
    line.text = reader.until("|");
    if (reader.atEnd()) {
        return line;
    }
    if (!line.text.ends_with(' ')) {
        throw NoPluginLine{"no blank before the bar"};
    }
    line.text.pop_back();
    reader.need("| ");
    line.data.push_back(readMeasurement(reader));
    while (!reader.atEnd()) {
        reader.need(" ");
        line.data.push_back(readMeasurement(reader));
    }
    return line;
}

bool alerts(const std::string& range, double value) {
    if (range.empty()) {
        return false;
    }
    Reader reader{range};
    Range bounds{};
    readRange(reader, bounds);
    const bool isInside = bounds.start <= value && value <= bounds.end;
    return isInside == bounds.inside;
}

}  // namespace raidinfo::test
