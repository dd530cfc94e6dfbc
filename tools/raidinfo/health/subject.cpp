#include "health/subject.h"

#include <algorithm>
#include <cctype>
#include <map>
#include <set>
#include <utility>

#include "codebook/code_book.h"
#include "health/vocabulary.h"
#include "inventory/value.h"

namespace raidinfo::health {
namespace {

const Value* valueIn(const Node& node, std::string_view field) {
    if (const Value* const known = findExtra(node.extras, field)) {
        return known;
    }
    if (node.record == nullptr) {
        return nullptr;
    }
    const auto index = fieldIndex(*node.kind, field);
    return index < 0 ? nullptr : &node.record->at(static_cast<std::size_t>(index));
}

/// "disk drive 3"
std::string inAddress(std::string title) {
    title[0] = static_cast<char>(std::tolower(static_cast<unsigned char>(title[0])));
    return title;
}

std::string shownField(const Subject& subject, std::string_view field) {
    const Value* const value = subject.find(field);
    return value == nullptr ? "" : shown(*value);
}

/// The family of an adapter says nothing about where it is.
std::string step(const Subject& subject) {
    if (subject.kind == anyAdapter) {
        return "adapter " + shownField(subject, "adapter_id");
    }
    if (subject.kind == arrayMembers) {
        return "member " + inAddress(subject.node->title) + " of channel " +
               shownField(subject, "channel_id");
    }
    return inAddress(subject.node->title);
}

std::string serial(const Subject& subject) {
    const Value* const value = subject.find("serial_number");
    const auto* const text = value == nullptr ? nullptr : std::get_if<std::string>(value);
    return text == nullptr || text->empty() ? "" : ", serial " + shown(*value);
}

class Walk {
public:
    void visit(const Group& group, std::string_view kind, const std::vector<std::size_t>& above,
               const std::string& addressAbove) {
        for (const Node& node : group.nodes) {
            // A logical drive may be listed in two arrays.
            if (!node.inFull || !node.position ||
                seen.emplace(node.kind->id, *node.position).second) {
                visit(node, node.inFull ? kind : arrayMembers, above, addressAbove);
            }
        }
    }

    std::vector<Subject> taken() {
        for (Subject& subject : subjects) {
            if (subject.kind == arrayMembers && subject.node->position) {
                const auto drive = drives.find(*subject.node->position);
                subject.drive = drive == drives.end() ? nullptr : drive->second;
            }
            subject.address += serial(subject);
        }
        return std::move(subjects);
    }

private:
    void visit(const Node& node, std::string_view kind, std::vector<std::size_t> above,
               const std::string& addressAbove) {
        Subject subject{.kind = kind,
                        .node = &node,
                        .above = above,
                        .places = placesOf(node, above),
                        .address = addressAbove};
        subject.address += (addressAbove.empty() ? "" : ", ") + step(subject);
        if (node.kind != nullptr && node.kind->id == KindId::diskDrive && node.inFull &&
            node.position) {
            drives.emplace(*node.position, &node);
        }
        above.push_back(subjects.size());
        const std::string address = subject.address;
        subjects.push_back(std::move(subject));
        for (const Group& group : node.groups) {
            visit(group, group.key, above, address);
        }
    }

    Extras placesOf(const Node& node, const std::vector<std::size_t>& above) const {
        Extras places;
        if (node.kind != nullptr) {
            std::vector<const Node*> holders;
            for (const std::size_t holder : above) {
                holders.push_back(subjects[holder].node);
            }
            for (const TreeField& field : node.kind->fromTree) {
                if (field.holder) {
                    places.emplace_back(field.key, valueOf(field, node, holders));
                }
            }
        }
        return places;
    }

    std::vector<Subject> subjects;
    std::set<std::pair<KindId, std::size_t>> seen;
    std::map<std::size_t, const Node*> drives;  ///< by position
};

}  // namespace

const Value* Subject::find(std::string_view field) const {
    if (const Value* const value = valueIn(*node, field)) {
        return value;
    }
    return drive != nullptr ? valueIn(*drive, field) : findExtra(places, field);
}

std::vector<Subject> subjectsOf(const Group& adapters) {
    Walk walk;
    walk.visit(adapters, anyAdapter, {}, "");
    return walk.taken();
}

}  // namespace raidinfo::health
