#include <nlohmann/json.hpp>
#include <string>

#include "commands/commands.h"
#include "exit_status.h"
#include "json/json.h"
#include "listing/listing.h"
#include "presentation/table.h"

namespace raidinfo {
namespace {

/// A line for each column: its title, its key, the value.
std::string fieldTable(const Listing& record, const GridLayout& layout, const CodeBook& book) {
    GridColumn titles{"Field", false, {}};
    GridColumn keys{"Key", false, {}};
    GridColumn values{"Value", false, {}};
    for (std::size_t index = 0; index < record.columns.size(); ++index) {
        const ListColumn& column = record.columns[index];
        const Value& value = record.rows.front()[index];
        titles.cells.push_back({std::string{index == 0 ? "Position" : column.title}});
        keys.cells.push_back({std::string{column.key}});
        values.cells.push_back({column.field == nullptr
                                    ? shown(value)
                                    : book.shown(record.kind->key, column.key, value),
                                styleOf(value, column.field)});
    }
    return drawn({titles, keys, values}, layout);
}

}  // namespace

int runCommand(const Session& session, const ShowOptions& show) {
    const Trees trees = session.inventory();
    Listing listing = listingOf(*show.kind, trees.snapshot(), trees.adapters());
    const auto position = static_cast<std::size_t>(show.position);
    if (position >= listing.rows.size()) {
        throw Failure{ExitStatus::usage, std::string{show.kind->key} + " has no position " +
                                             std::to_string(position) + "; it has " +
                                             std::to_string(listing.rows.size()) + " records"};
    }
    listing.rows = {std::move(listing.rows[position])};
    if (session.options().json) {
        session.print(Json::object(
            {{"kind", std::string{show.kind->key}}, {"record", rowsJson(listing).front()}}));
    } else {
        session.output().write(fieldTable(listing, session.layout(), session.codeBook()));
    }
    return 0;
}

}  // namespace raidinfo
