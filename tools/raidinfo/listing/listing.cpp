#include "listing/listing.h"

#include <algorithm>
#include <iterator>
#include <map>
#include <utility>

#include "text/enumerated.h"

namespace raidinfo {
namespace {

/// What the tree tells of a kind's records, by position.
using ValuesByPosition = std::map<std::size_t, std::vector<Value>>;

void gather(const Kind& kind, const Group& group, std::vector<const Node*>& holders,
            ValuesByPosition& found) {
    for (const Node& node : group.nodes) {
        if (node.kind == &kind && node.inFull && node.position) {
            std::vector<Value>& values = found[*node.position];
            for (const TreeField& field : kind.fromTree) {
                values.push_back(valueOf(field, node, holders));
            }
        }
        holders.push_back(&node);
        for (const Group& below : node.groups) {
            gather(kind, below, holders, found);
        }
        holders.pop_back();
    }
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

std::string withoutColumn(const Kind& kind, std::string_view key) {
    return std::string{kind.key} + " has no column \"" + std::string{key} + "\"; it has " +
           enumerated(columnsOf(kind), &ListColumn::key);
}

Listing listingOf(const Kind& kind, const Snapshot& snapshot, const Group& trees) {
    ValuesByPosition fromTree;
    if (!kind.fromTree.empty()) {
        std::vector<const Node*> holders;
        gather(kind, trees, holders, fromTree);
    }
    Listing listing{&kind, columnsOf(kind), {}};
    const Records& records = snapshot.of(kind.id);
    listing.rows.reserve(records.size());
    for (std::size_t position = 0; position < records.size(); ++position) {
        std::vector<Value>& row = listing.rows.emplace_back();
        row.reserve(listing.columns.size());
        row.emplace_back(static_cast<int>(position));
        std::vector<Value>& known = fromTree[position];
        known.resize(kind.fromTree.size(), Unknown{});
        std::ranges::move(known, std::back_inserter(row));
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
