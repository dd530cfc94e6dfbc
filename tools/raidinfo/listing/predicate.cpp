#include "listing/predicate.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cstdint>
#include <optional>
#include <set>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "exit_status.h"
#include "inventory/overall_status.h"
#include "text/enumerated.h"

namespace raidinfo {
namespace {

using Comparison = Filter::Comparison;

template <typename T>
bool holds(const T& value, Comparison comparison, const T& wanted) {
    switch (comparison) {
        case Comparison::notEqual:
            return value != wanted;
        case Comparison::atMost:
            return value <= wanted;
        case Comparison::atLeast:
            return value >= wanted;
        case Comparison::equal:
            return value == wanted;
        case Comparison::less:
            return value < wanted;
        case Comparison::greater:
            return value > wanted;
        case Comparison::contains:
            break;
    }
    return false;
}

bool textHolds(const std::string& value, const Filter& filter) {
    return filter.comparison == Comparison::contains
               ? value.find(filter.value) != std::string::npos
               : holds(value, filter.comparison, filter.value);
}

/// A test of the values that are a T. What the tree does not know, and an overall status that the
/// library does not know, are "unknown".
template <typename T, typename Test>
Predicate onEach(const Filter& filter, Test test) {
    return [filter, test](const Value& value) {
        const T* const held = std::get_if<T>(&value);
        return held == nullptr ? textHolds(shown(value), filter) : test(*held);
    };
}

Failure incomparable(const Filter& filter, const std::string& wanted) {
    return {ExitStatus::usage,
            "\"" + filter.value + "\" cannot be compared with " + filter.key + ", " + wanted};
}

std::optional<std::int64_t> numberIn(const std::string& text) {
    std::int64_t number = 0;
    const char* const end = text.data() + text.size();
    const auto [stop, error] = std::from_chars(text.data(), end, number);
    return error == std::errc{} && stop == end ? std::optional{number} : std::nullopt;
}

std::int64_t wantedNumber(const Filter& filter) {
    const auto number = numberIn(filter.value);
    if (!number) {
        throw incomparable(filter, "a number");
    }
    return *number;
}

/// The names of codes, each once, and what a code without a name is called.
std::string namesOf(const CodeBook::Codes& codes) {
    std::set<std::string_view> names{unknownWord};
    for (const auto& [code, name] : codes) {
        names.insert(name);
    }
    return enumerated(names);
}

/// "state=online": several codes can have one name, and any code can be without one.
Predicate codePredicate(const Filter& filter, const CodeBook::Codes& codes) {
    const auto nameOf = [&codes](int code) {
        const auto found = codes.find(code);
        return found == codes.end() ? std::string{unknownWord} : found->second;
    };
    if (filter.comparison == Comparison::contains) {
        return onEach<int>(filter, [=](int code) {
            return textHolds(std::to_string(code), filter) || textHolds(nameOf(code), filter);
        });
    }
    const bool isName =
        filter.value == unknownWord ||
        std::ranges::any_of(codes, [&](const auto& code) { return code.second == filter.value; });
    const bool isOrdered =
        filter.comparison != Comparison::equal && filter.comparison != Comparison::notEqual;
    if (!isName || isOrdered) {
        throw incomparable(filter, "which is a number or, for = and !=, one of " + namesOf(codes) +
                                       ", or, for ~, a part of one");
    }
    return onEach<int>(filter, [=](int code) { return textHolds(nameOf(code), filter); });
}

Predicate numberPredicate(const Filter& filter, const CodeBook::Meaning* meaning) {
    const auto* const codes = meaning == nullptr ? nullptr : std::get_if<CodeBook::Codes>(meaning);
    const auto wanted = numberIn(filter.value);
    if (codes != nullptr && !wanted) {
        return codePredicate(filter, *codes);
    }
    if (filter.comparison == Comparison::contains) {
        return onEach<int>(filter,
                           [=](int number) { return textHolds(std::to_string(number), filter); });
    }
    return onEach<int>(filter,
                       [comparison = filter.comparison, number = wantedNumber(filter)](int value) {
                           return holds(std::int64_t{value}, comparison, number);
                       });
}

/// Of the value as it is shown.
Predicate shownPredicate(const Filter& filter) {
    return [filter](const Value& value) { return textHolds(shown(value), filter); };
}

Predicate flagPredicate(const Filter& filter) {
    if (filter.comparison == Comparison::contains) {
        return shownPredicate(filter);
    }
    constexpr auto words = std::to_array<std::pair<std::string_view, bool>>({{"yes", true},
                                                                             {"no", false},
                                                                             {"true", true},
                                                                             {"false", false},
                                                                             {"1", true},
                                                                             {"0", false}});
    const auto found = std::ranges::find(words, std::string_view{filter.value},
                                         &std::pair<std::string_view, bool>::first);
    if (found == words.end()) {
        throw incomparable(filter, "which is yes or no");
    }
    return onEach<bool>(filter, [comparison = filter.comparison, wanted = found->second](
                                    bool flag) { return holds(flag, comparison, wanted); });
}

Predicate statusPredicate(const Filter& filter) {
    if (filter.comparison != Comparison::contains && filter.value != unknownWord &&
        std::ranges::find(overallStatusWords, filter.value) == overallStatusWords.end()) {
        throw incomparable(filter, "which is " + enumerated(overallStatusWords) + " or " +
                                       std::string{unknownWord});
    }
    return shownPredicate(filter);
}

Predicate listPredicate(const Filter& filter) {
    using Numbers = std::vector<int>;
    if (filter.comparison != Comparison::contains) {
        return shownPredicate(filter);
    }
    return onEach<Numbers>(filter, [wanted = wantedNumber(filter)](const Numbers& numbers) {
        return std::ranges::find(numbers, wanted) != numbers.end();
    });
}

Predicate textPredicate(const Filter& filter) {
    return onEach<std::string>(
        filter, [filter](const std::string& text) { return textHolds(text, filter); });
}

}  // namespace

Predicate predicateOf(const Filter& filter, Shape shape, const CodeBook::Meaning* meaning) {
    switch (shape) {
        case Shape::number:
        case Shape::constant:
            return numberPredicate(filter, meaning);
        case Shape::flag:
            return flagPredicate(filter);
        case Shape::statusText:
            return statusPredicate(filter);
        case Shape::numbers:
            return listPredicate(filter);
        case Shape::text:
        case Shape::displayName:
            break;
    }
    return textPredicate(filter);
}

}  // namespace raidinfo
