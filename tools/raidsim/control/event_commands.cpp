#include <algorithm>
#include <array>
#include <optional>
#include <string_view>

#include "control/makers.h"
#include "service.h"
#include "text.h"

namespace raidsim::makers {

namespace {

struct PlaceForm {
    std::string_view name;
    EventPlace::Kind kind;
    bool hasNeighbour;
};

constexpr std::array<PlaceForm, 4> placeForms{{
    {"last", EventPlace::Kind::last, false},
    {"first", EventPlace::Kind::first, false},
    {"before", EventPlace::Kind::before, true},
    {"after", EventPlace::Kind::after, true},
}};

EventPlace parsePlace(const std::string& text) {
    const std::string_view word = text;
    const auto colon = word.find(':');
    const auto form = std::ranges::find(placeForms, word.substr(0, colon), &PlaceForm::name);
    const bool numbered = colon != std::string_view::npos;
    const auto neighbour = numbered ? parseInt(word.substr(colon + 1)) : std::optional(0);
    if (form == placeForms.end() || form->hasNeighbour != numbered || !neighbour) {
        throw CommandError("\"" + text +
                           "\" is no place: last, first, before:NUMBER or after:NUMBER");
    }
    return {form->kind, *neighbour};
}

}  // namespace

Command event(const Arguments& arguments) {
    EventLog::Fields fields;
    std::optional<EventPlace> place;
    for (const auto& [name, value] : arguments.fields(0)) {
        if (name == "place") {
            place = parsePlace(value);
        } else {
            fields.emplace_back(name, value);
        }
    }
    if (place) {
        EventLog::check(fields);
    } else {
        EventLog::checkWithoutPlace(fields);
    }
    return [fields = std::move(fields), place](Service& service) {
        service.addEvent(fields, place);
        return Outcome{};
    };
}

Command forget(const Arguments& arguments) {
    if (arguments.words.empty()) {
        return [](Service& service) {
            service.events().clear();
            service.answerFromState(RequestKind::newest);
            return Outcome{};
        };
    }
    const auto newest = parseInt(arguments.words[0]);
    if (!newest || *newest < 0)
        throw CommandError("\"" + arguments.words[0] + "\" is not the number of an event");
    return [newest = *newest](Service& service) {
        EventLog& log = service.events();
        if (newest > log.newest())
            throw CommandError("the newest event is " + std::to_string(log.newest()));
        log.rollBack(newest);
        service.answerFromState(RequestKind::newest);
        return Outcome{};
    };
}

}  // namespace raidsim::makers
