#include "control/template.h"

#include <algorithm>
#include <cstddef>
#include <optional>

#include "control/command.h"
#include "overloaded.h"
#include "text.h"

namespace raidsim {

namespace {

// What a turn is told by; no names.
constexpr std::string_view percentName = "percent";
constexpr std::string_view countName = "count";
constexpr std::string_view indexName = "index";
constexpr std::string_view openBrace = "{{";  // stands for one

bool isReserved(std::string_view name) {
    return name == percentName || name == countName || name == indexName;
}

bool mayBeName(std::string_view word) {
    const auto letter = [](char c) { return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z'); };
    return !word.empty() && letter(word.front()) && std::ranges::all_of(word, [&](char c) {
        return letter(c) || (c >= '0' && c <= '9') || c == '-';
    });
}

// Calls text(part) for what stands outside of braces and held(part) for what they hold. Two opening
// braces belong to the text.
template <typename Text, typename Held>
void forEachPart(std::string_view line, Text text, Held held) {
    while (!line.empty()) {
        const auto open = line.find('{');
        if (open == std::string_view::npos) {
            text(line);
            return;
        }
        if (line.substr(open).starts_with(openBrace)) {
            text(line.substr(0, open + openBrace.size()));
            line.remove_prefix(open + openBrace.size());
            continue;
        }
        const auto close = line.find('}', open);
        if (close == std::string_view::npos)
            throw CommandError("a brace is not closed; two of them, \"{{\", stand for one");
        text(line.substr(0, open));
        held(line.substr(open + 1, close - open - 1));
        line.remove_prefix(close + 1);
    }
}

}  // namespace

void Names::define(const std::string& name, const std::string& value) {
    if (!mayBeName(name) || isReserved(name))
        throw CommandError("\"" + name + "\" cannot be a name");
    if (!values.emplace(name, value).second)
        throw CommandError("\"" + name + "\" has a meaning already");
}

std::string Names::replacedIn(std::string_view line) const {
    std::string replaced;
    forEachPart(
        line, [&](std::string_view text) { replaced.append(text); },
        [&](std::string_view held) {
            const auto found = values.find(held);
            if (found != values.end()) {
                replaced.append(found->second);
            } else if (mayBeName(held) && !isReserved(held)) {
                throw CommandError("nothing is called {" + std::string(held) + "}");
            } else {
                replaced.append("{").append(held).append("}");
            }
        });
    return replaced;
}

Template::Part Template::parsePlaceholder(std::string_view text) {
    if (text == percentName)
        return Percent{};
    if (text == countName)
        return Count{1};
    if (text == indexName)
        return Count{0};
    if (text.find('|') != std::string_view::npos) {
        const auto choices = split(text, '|');
        return Choices(choices.begin(), choices.end());
    }
    const auto dots = text.find("..");
    const auto low = parseInt(text.substr(0, dots));
    const auto high = dots == std::string_view::npos ? low : parseInt(text.substr(dots + 2));
    if (dots == std::string_view::npos || !low || !high || *low > *high) {
        throw CommandError(
            "{" + std::string(text) +
            "} is none of {percent}, {count}, {index}, {LOWEST..HIGHEST}, {THIS|THAT}");
    }
    return Range{*low, *high};
}

Template Template::parse(std::string_view text) {
    Template made;
    forEachPart(
        text,
        [&](std::string_view part) {
            const bool brace = part.ends_with(openBrace);
            made.parts.emplace_back(std::string(part.substr(0, part.size() - (brace ? 1 : 0))));
        },
        [&](std::string_view held) {
            made.parts.push_back(parsePlaceholder(held));
            made.variable = true;
        });
    return made;
}

std::string Template::filled(Turn turn, const Choose& choose) const {
    const Overloaded fill{
        [](const std::string& text) { return text; },
        [&](Percent) {
            return std::to_string(turn.of == 1 ? 100 : turn.number * 100 / (turn.of - 1));
        },
        [&](Count count) { return std::to_string(turn.number + count.from); },
        [&](const Range& range) {
            const std::int64_t low = range.low;
            const auto size = static_cast<std::uint64_t>(range.high - low) + 1;
            return std::to_string(low + static_cast<std::int64_t>(choose(size)));
        },
        [&](const Choices& choices) {
            return choices[static_cast<std::size_t>(choose(choices.size()))];
        },
    };
    std::string line;
    for (const Part& part : parts)
        line += std::visit(fill, part);
    return line;
}

std::string Template::at(Turn turn, Draw draw) const {
    return filled(turn, [&](std::uint64_t size) { return draw.below(size); });
}

std::vector<std::string> Template::samples(std::uint64_t turns) const {
    std::size_t count = variable ? 2 : 1;
    for (const Part& part : parts) {
        if (const auto* const choices = std::get_if<Choices>(&part))
            count = std::max(count, choices->size());
    }
    std::vector<std::string> lines;
    for (std::size_t number = 0; number < count; ++number) {
        // Of many sizes, the odd sample takes the end.
        const bool odd = number % 2 == 1;
        lines.push_back(filled({odd ? turns - 1 : 0, turns}, [&](std::uint64_t size) {
            return size <= count ? number % size : odd ? size - 1 : 0;
        }));
    }
    return lines;
}

}  // namespace raidsim
