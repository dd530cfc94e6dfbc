#include "listing/filter.h"

#include <algorithm>
#include <array>
#include <utility>

#include "exit_status.h"
#include "listing/predicate.h"

namespace raidinfo {
namespace {

using Comparison = Filter::Comparison;

// Those of two characters first.
constexpr auto operators = std::to_array<std::pair<std::string_view, Comparison>>({
    {"!=", Comparison::notEqual},
    {"<=", Comparison::atMost},
    {">=", Comparison::atLeast},
    {"=", Comparison::equal},
    {"<", Comparison::less},
    {">", Comparison::greater},
    {"~", Comparison::contains},
});

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

void checkFilters(const std::vector<Filter>& filters, const Kind& kind, const CodeBook& book) {
    const std::vector<ListColumn> columns = columnsOf(kind);
    for (const Filter& filter : filters) {
        const auto column = columnOf(filter, columns);
        if (column == columns.end()) {
            throw Failure{ExitStatus::usage, withoutColumn(kind, filter.key)};
        }
        static_cast<void>(predicateOf(filter, column->shape, book.find(kind.key, column->key)));
    }
}

Listing filtered(Listing listing, const std::vector<Filter>& filters, const CodeBook& book) {
    checkFilters(filters, *listing.kind, book);
    for (const Filter& filter : filters) {
        const auto column = columnOf(filter, listing.columns);
        const auto index = static_cast<std::size_t>(column - listing.columns.begin());
        const Predicate fulfils =
            predicateOf(filter, column->shape, book.find(listing.kind->key, column->key));
        std::erase_if(listing.rows,
                      [&](const std::vector<Value>& row) { return !fulfils(row[index]); });
    }
    return listing;
}

}  // namespace raidinfo
