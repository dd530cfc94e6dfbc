#include "listing/column_choice.h"

#include <algorithm>

#include "exit_status.h"

namespace raidinfo {
namespace {

void take(std::vector<std::size_t>& chosen, std::size_t column) {
    if (std::ranges::find(chosen, column) == chosen.end()) {
        chosen.push_back(column);
    }
}

}  // namespace

ColumnChoice parseColumns(std::string_view text) {
    if (text == "all") {
        return {.all = true};
    }
    ColumnChoice choice{.chief = text.starts_with('+')};
    std::string_view rest = text.substr(choice.chief ? 1 : 0);
    for (bool more = true; more;) {
        const std::size_t comma = rest.find(',');
        choice.keys.emplace_back(rest.substr(0, comma));
        if (choice.keys.back().empty()) {
            throw Failure{ExitStatus::usage,
                          "\"" + std::string{text} + "\" is not a list of columns"};
        }
        more = comma != std::string_view::npos;
        rest.remove_prefix(more ? comma + 1 : rest.size());
    }
    return choice;
}

std::vector<std::size_t> chosenColumns(const ColumnChoice& choice, const Kind& kind) {
    const std::vector<ListColumn> columns = columnsOf(kind);
    std::vector<std::size_t> chosen;
    for (std::size_t index = 0; index < columns.size(); ++index) {
        if (choice.all || (choice.chief && columns[index].chief)) {
            take(chosen, index);
        }
    }
    for (const std::string& key : choice.keys) {
        const auto found = std::ranges::find(columns, key, &ListColumn::key);
        if (found == columns.end()) {
            throw Failure{ExitStatus::usage, withoutColumn(kind, key)};
        }
        take(chosen, static_cast<std::size_t>(found - columns.begin()));
    }
    return chosen;
}

}  // namespace raidinfo
