#include <algorithm>
#include <array>
#include <string>
#include <vector>

#include "diff/diff.h"
#include "text/enumerated.h"

namespace raidinfo::diff {
namespace {

/// The word for a change in JSON, and in a sentence, where it follows the noun.
struct TypeWords {
    Type type;
    std::string_view key;
    std::string_view verb;
};

constexpr std::array typeWords{
    TypeWords{Type::changed, "changed", ""},           TypeWords{Type::moved, "moved", ""},
    TypeWords{Type::replaced, "replaced", "replaced"}, TypeWords{Type::added, "added", "added"},
    TypeWords{Type::removed, "removed", "removed"},
};

const TypeWords& wordsOf(Type type) {
    return *std::ranges::find(typeWords, type, &TypeWords::type);
}

std::string_view wordOf(Direction direction) {
    switch (direction) {
        case Direction::worse:
            return "worse";
        case Direction::better:
            return "better";
        case Direction::neutral:
            break;
    }
    return "neutral";
}

std::string placeStep(const Step& step) {
    return std::string{step.label} + " " + step.number.dump();
}

std::string sentence(const Change& change) {
    std::vector<std::string> events;
    if (change.type != Type::changed) {
        const std::string verb{wordsOf(change.type).verb};
        events.push_back(std::string{change.noun} + " " + (verb.empty() ? change.origin : verb));
    }
    for (const Detail& detail : change.details) {
        events.push_back(detail.text);
    }
    return enumerated(change.place, placeStep) + ": " + enumerated(events);
}

Json placeData(const Place& place) {
    auto data = Json::object();
    for (const Step& step : place) {
        data[std::string{step.key}] = step.number;
    }
    return data;
}

Json detailData(const Detail& detail) {
    return {{"key", detail.key},
            {"title", detail.title},
            {"before", detail.before},
            {"after", detail.after},
            {"direction", wordOf(detail.direction)},
            {"text", detail.text}};
}

Json changeData(const Change& change) {
    auto data = Json::object();
    data["change"] = wordsOf(change.type).key;
    data["direction"] = wordOf(change.direction);
    data["kind"] = change.kind;
    data["place"] = placeData(change.place);
    if (change.type == Type::moved) {
        data["former_place"] = placeData(change.former);
    }
    data["text"] = sentence(change);
    data["details"] = Json::array();
    for (const Detail& detail : change.details) {
        data["details"].push_back(detailData(detail));
    }
    return data;
}

}  // namespace

std::string told(const std::vector<Change>& changes) {
    constexpr std::size_t columns = 8;
    std::string lines;
    for (const Change& change : changes) {
        std::string line{change.direction == Direction::neutral ? "" : wordOf(change.direction)};
        line.resize(columns, ' ');
        lines += line + sentence(change) + "\n";
    }
    return lines.empty() ? "No changes\n" : lines;
}

Json changesData(const std::vector<Change>& changes) {
    auto list = Json::array();
    for (const Change& change : changes) {
        list.push_back(changeData(change));
    }
    auto data = Json::object();
    data["changes"] = std::move(list);
    return data;
}

}  // namespace raidinfo::diff
