#include "listing/filter.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cstdint>
#include <optional>
#include <utility>

#include "exit_status.h"
#include "inventory/value.h"
#include "overloaded.h"

namespace raidinfo {
namespace {

using Comparison = Filter::Comparison;

// Those of two characters first.
constexpr auto statusWords =
    std::to_array<std::string_view>({"Normal", "Warning", "Critical", "unknown"});

constexpr auto operators = std::to_array<std::pair<std::string_view, Comparison>>({
    {"!=", Comparison::notEqual},
    {"<=", Comparison::atMost},
    {">=", Comparison::atLeast},
    {"=", Comparison::equal},
    {"<", Comparison::less},
    {">", Comparison::greater},
    {"~", Comparison::contains},
});

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

bool textHolds(const std::string& value, Comparison comparison, const std::string& wanted) {
    return comparison == Comparison::contains ? value.find(wanted) != std::string::npos
                                              : holds(value, comparison, wanted);
}

Failure incomparable(const Filter& filter, const char* wanted) {
    return {ExitStatus::usage,
            "\"" + filter.value + "\" cannot be compared with " + filter.key + ", " + wanted};
}

std::int64_t numberIn(const Filter& filter) {
    std::int64_t number = 0;
    const char* const end = filter.value.data() + filter.value.size();
    const auto [stop, error] = std::from_chars(filter.value.data(), end, number);
    if (error != std::errc{} || stop != end) {
        throw incomparable(filter, "a number");
    }
    return number;
}

bool flagIn(const Filter& filter) {
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
    return found->second;
}

bool numberHolds(std::int64_t number, const Filter& filter) {
    return filter.comparison == Comparison::contains
               ? std::to_string(number).find(filter.value) != std::string::npos
               : holds(number, filter.comparison, numberIn(filter));
}

bool fulfils(const Value& value, const Filter& filter) {
    return std::visit(
        Overloaded{
            [&](int number) { return numberHolds(number, filter); },
            [&](bool flag) { return holds(flag, filter.comparison, flagIn(filter)); },
            [&](const std::string& text) {
                return textHolds(text, filter.comparison, filter.value);
            },
            [&](UnknownStatus) { return textHolds("unknown", filter.comparison, filter.value); },
            [&](const std::vector<int>& numbers) {
                return filter.comparison == Comparison::contains
                           ? std::ranges::find(numbers, numberIn(filter)) != numbers.end()
                           : textHolds(shown(numbers), filter.comparison, filter.value);
            }},
        value);
}

/// Fails for a value that no record of the column could be compared with.
void check(const Filter& filter, const ListColumn& column) {
    const Shape shape = column.shape;
    const bool contains = filter.comparison == Comparison::contains;
    if (shape == Shape::flag) {
        static_cast<void>(flagIn(filter));
    } else if (shape == Shape::statusText) {
        if (!contains && std::ranges::find(statusWords, filter.value) == statusWords.end()) {
            throw incomparable(filter, "which is Normal, Warning, Critical or unknown");
        }
    } else if ((shape == Shape::numbers) == contains &&
               (shape == Shape::number || shape == Shape::constant || shape == Shape::numbers)) {
        static_cast<void>(numberIn(filter));
    }
}

auto columnOf(const Filter& filter, const std::vector<ListColumn>& columns) {
    return std::ranges::find(columns, std::string_view{filter.key}, &ListColumn::key);
}

}  // namespace

Filter parseFilter(std::string_view text) {
    const std::size_t position = text.find_first_of("!<>=~");
    if (position != std::string_view::npos && position > 0) {
        for (const auto& [sign, comparison] : operators) {
            if (text.substr(position).starts_with(sign)) {
                return {std::string{text.substr(0, position)}, comparison,
                        std::string{text.substr(position + sign.size())}};
            }
        }
    }
    throw Failure{ExitStatus::usage,
                  "\"" + std::string{text} + "\" is not a filter such as state!=0 or vendor~ABC"};
}

bool concerns(const Filter& filter, const Kind& kind) noexcept {
    const auto hasKey = [&filter](const auto& field) { return field.key == filter.key; };
    return filter.key == "position" || std::ranges::any_of(kind.fields, hasKey) ||
           std::ranges::any_of(kind.fromTree, hasKey);
}

void checkFilters(const std::vector<Filter>& filters, const Kind& kind) {
    const std::vector<ListColumn> columns = columnsOf(kind);
    for (const Filter& filter : filters) {
        const auto column = columnOf(filter, columns);
        if (column == columns.end()) {
            throw Failure{ExitStatus::usage,
                          std::string{kind.key} + " has no column \"" + filter.key + "\""};
        }
        check(filter, *column);
    }
}

Listing filtered(Listing listing, const std::vector<Filter>& filters) {
    checkFilters(filters, *listing.kind);
    for (const Filter& filter : filters) {
        const auto column = columnOf(filter, listing.columns);
        const auto index = static_cast<std::size_t>(column - listing.columns.begin());
        std::erase_if(listing.rows, [index, &filter](const std::vector<Value>& row) {
            return !fulfils(row[index], filter);
        });
    }
    return listing;
}

}  // namespace raidinfo
