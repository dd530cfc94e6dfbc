#include "presentation/table.h"

#include <algorithm>
#include <array>
#include <vector>

#include "inventory/overall_status.h"

namespace raidinfo {
namespace {

bool isNumber(Shape shape) { return shape == Shape::number || shape == Shape::constant; }

/// Numbers are, but not those with a name behind them.
bool isToTheRight(const ListColumn& column, const CodeBook::Meaning* meaning) {
    return isNumber(column.shape) &&
           (meaning == nullptr || !std::holds_alternative<CodeBook::Codes>(*meaning));
}

std::vector<GridColumn> gridOf(const Listing& listing, const CodeBook& book) {
    std::vector<GridColumn> columns;
    columns.reserve(listing.columns.size() + 1);
    for (std::size_t index = 0; index < listing.columns.size(); ++index) {
        const ListColumn& listed = listing.columns[index];
        const CodeBook::Meaning* const meaning =
            listed.field == nullptr ? nullptr : book.find(listing.kind->key, listed.field->key);
        GridColumn& column = columns.emplace_back(
            GridColumn{std::string{listed.title}, isToTheRight(listed, meaning), {}});
        column.cells.reserve(listing.rows.size());
        for (const std::vector<Value>& row : listing.rows) {
            column.cells.push_back({shown(row[index], meaning), styleOf(row[index], listed.field)});
        }
    }
    return columns;
}

}  // namespace

Style styleOf(const Value& value, const Field* field) {
    constexpr std::array styles{Style::good, Style::warning, Style::critical};
    static_assert(styles.size() == overallStatusWords.size());
    if (field == nullptr || field->shape != Shape::statusText) {
        return Style::plain;
    }
    if (const auto* const text = std::get_if<std::string>(&value)) {
        const auto word = std::ranges::find(overallStatusWords, *text);
        if (word != overallStatusWords.end()) {
            return styles[static_cast<std::size_t>(word - overallStatusWords.begin())];
        }
    }
    return Style::unknown;
}

std::string table(const Listing& listing, const GridLayout& layout, const CodeBook& book) {
    return drawn(gridOf(listing, book), layout);
}

std::string namedTable(const Listing& listing, const GridLayout& layout, const CodeBook& book) {
    std::vector<GridColumn> columns = gridOf(listing, book);
    const std::vector<Cell> names(listing.rows.size(), Cell{std::string{listing.kind->key}});
    columns.insert(columns.begin(), GridColumn{"Kind", false, names});
    return drawn(columns, layout);
}

std::string titledTable(const Listing& listing, const GridLayout& layout, const CodeBook& book) {
    const std::string title =
        std::string{listing.kind->plural} + ": " + std::to_string(listing.rows.size()) + "\n";
    return listing.rows.empty() ? title : title + table(listing, layout, book);
}

}  // namespace raidinfo
