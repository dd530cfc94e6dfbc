#include "listing/listing.h"

#include <algorithm>
#include <map>
#include <utility>

namespace raidinfo {
namespace {

/// The extras of the kind's records by position.
using ExtrasByPosition = std::map<std::size_t, const Extras*>;

void gather(const Kind& kind, const Group& group, ExtrasByPosition& found) {
    for (const Node& node : group.nodes) {
        if (node.kind == &kind && node.inFull && node.position) {
            found.emplace(*node.position, &node.extras);
        }
        for (const Group& below : node.groups) {
            gather(kind, below, found);
        }
    }
}

Value extraOf(const Extras* extras, std::string_view key) {
    if (extras != nullptr) {
        const auto found = std::ranges::find(*extras, key, &Extras::value_type::first);
        if (found != extras->end()) {
            return found->second;
        }
    }
    return UnknownStatus{};
}

}  // namespace

std::vector<ListColumn> columnsOf(const Kind& kind) {
    std::vector<ListColumn> columns{{"position", "#", nullptr, Shape::number, true}};
    for (const TreeField& field : kind.fromTree) {
        columns.push_back(
            {field.key, field.title, nullptr, field.shape, field.summary != Summary::no});
    }
    for (const Field& field : kind.fields) {
        columns.push_back(
            {field.key, field.title, &field, field.shape, field.summary != Summary::no});
    }
    return columns;
}

Listing listingOf(const Kind& kind, const Snapshot& snapshot, const Group& trees) {
    ExtrasByPosition extras;
    if (!kind.fromTree.empty()) {
        gather(kind, trees, extras);
    }
    Listing listing{&kind, columnsOf(kind), {}};
    const Records& records = snapshot.of(kind.id);
    listing.rows.reserve(records.size());
    for (std::size_t position = 0; position < records.size(); ++position) {
        std::vector<Value>& row = listing.rows.emplace_back();
        row.reserve(listing.columns.size());
        row.emplace_back(static_cast<int>(position));
        const auto found = extras.find(position);
        for (const TreeField& field : kind.fromTree) {
            row.push_back(extraOf(found == extras.end() ? nullptr : found->second, field.key));
        }
        row.insert(row.end(), records[position].begin(), records[position].end());
    }
    return listing;
}

Listing withColumns(Listing listing, const std::vector<std::size_t>& columns) {
    // No column is chosen twice, so as many in order are all.
    if (columns.size() == listing.columns.size() && std::ranges::is_sorted(columns)) {
        return listing;
    }
    Listing result{listing.kind, {}, {}};
    for (const std::size_t column : columns) {
        result.columns.push_back(listing.columns[column]);
    }
    for (std::vector<Value>& row : listing.rows) {
        std::vector<Value>& chosen = result.rows.emplace_back();
        for (const std::size_t column : columns) {
            chosen.push_back(std::move(row[column]));
        }
    }
    return result;
}

}  // namespace raidinfo
