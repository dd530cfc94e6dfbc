#include <algorithm>
#include <nlohmann/json.hpp>
#include <string>
#include <vector>

#include "commands/commands.h"
#include "exit_status.h"
#include "json/json.h"
#include "listing/listing.h"
#include "presentation/table.h"

namespace raidinfo {
namespace {

bool haveColumns(const Kind& kind, const std::vector<Filter>& filters) {
    return std::ranges::all_of(filters,
                               [&kind](const Filter& filter) { return concerns(filter, kind); });
}

/// The kinds to list: the one asked for, or all of which the filters can hold. In
/// "state=rebuilding" that is every kind with such a state.
std::vector<const Kind*> kindsOf(const ListOptions& list, const CodeBook& book) {
    if (list.kind != nullptr) {
        checkFilters(list.filters, *list.kind, book);
        return {list.kind};
    }
    std::vector<const Kind*> kinds;
    std::string trouble;
    for (const Kind& kind : inventoryKinds()) {
        if (haveColumns(kind, list.filters)) {
            try {
                checkFilters(list.filters, kind, book);
                kinds.push_back(&kind);
            } catch (const Failure& failure) {
                trouble +=
                    (trouble.empty() ? "" : "; ") + std::string{kind.key} + ": " + failure.what();
            }
        }
    }
    if (kinds.empty()) {
        throw Failure{ExitStatus::usage,
                      trouble.empty() ? "no list has all the columns of the filters" : trouble};
    }
    return kinds;
}

/// People get the chief columns of a list that they name, programs everything; both what they ask
/// for.
ColumnChoice columnsOf(const ListOptions& list, bool json) {
    if (list.columns) {
        return *list.columns;
    }
    const bool everything = json || list.kind == nullptr;
    return {.all = everything, .chief = !everything};
}

Listing chosen(const Kind& kind, const Trees& trees, const ListOptions& list,
               const Session& session) {
    const auto columns = chosenColumns(columnsOf(list, session.options().json), kind);
    return withColumns(filtered(listingOf(kind, trees.snapshot(), trees.adapters()), list.filters,
                                session.codeBook()),
                       columns);
}

}  // namespace

int runCommand(const Session& session, const ListOptions& list) {
    const std::vector<const Kind*> kinds = kindsOf(list, session.codeBook());
    const bool json = session.options().json;
    for (const Kind* const kind : kinds) {
        // What is wrong with the command line is said before anybody is asked.
        static_cast<void>(chosenColumns(columnsOf(list, json), *kind));
    }
    const Trees trees = session.inventory();
    auto lists = Json::object();
    GridLayout layout = session.layout();
    layout.headings = list.headings;
    std::string text;
    for (const Kind* const kind : kinds) {
        const Listing listing = chosen(*kind, trees, list, session);
        if (json) {
            lists[std::string{kind->key}] = rowsJson(listing);
        } else if (list.kind != nullptr) {
            text = listing.rows.empty() && !list.headings
                       ? ""
                       : table(listing, layout, session.codeBook());
        } else if (list.headings) {
            text += (text.empty() ? "" : "\n") + titledTable(listing, layout, session.codeBook());
        } else if (!listing.rows.empty()) {
            text += namedTable(listing, layout, session.codeBook());
        }
    }
    if (json) {
        session.print(std::move(lists));
    } else {
        session.output().write(text);
    }
    return 0;
}

}  // namespace raidinfo
