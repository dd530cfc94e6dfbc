#include "diff/entries.h"

#include <algorithm>
#include <optional>
#include <unordered_map>

#include "diff/snapshot_file.h"

namespace raidinfo::diff {
namespace {

const Json* find(const Json& object, std::string_view key) {
    const auto found = object.find(key);
    return found == object.end() ? nullptr : &*found;
}

[[noreturn]] void refuse(std::string_view list, const std::string& reason) {
    throw SnapshotError{"not a snapshot: \"" + std::string{list} + "\" " + reason};
}

/// What stands around a record in the tree.
struct Around {
    std::array<const Entry*, subjectCount> entries{};
    std::string array = {};  ///< the innermost array: "array 0"

    [[nodiscard]] const Entry* at(SubjectId id) const {
        return entries[static_cast<std::size_t>(id)];
    }
};

/// Goes through a tree once.
class Walk {
public:
    explicit Walk(Entries& filled) : entries{filled} {}

    void readList(const Json* list, const Subject& subject, const Around& around) {
        if (list == nullptr) {
            return;
        }
        requireRecords(*list, listKey(subject), subject.number);
        for (const Json& record : *list) {
            readRecord(record, subject, around);
        }
    }

private:
    static void requireRecords(const Json& list, std::string_view key, std::string_view number) {
        if (!list.is_array()) {
            refuse(key, "is no list");
        }
        for (const Json& record : list) {
            const Json* const value = record.is_object() ? find(record, number) : nullptr;
            if (value == nullptr || !value->is_number_integer()) {
                refuse(key, "holds something without a number \"" + std::string{number} + "\"");
            }
        }
    }

    void readRecord(const Json& record, const Subject& subject, Around around) {
        Entry& entry = entryOf(record, subject, around);
        if (!around.array.empty()) {
            entry.holders.insert(around.array);
        }
        around.entries[static_cast<std::size_t>(subject.id)] = &entry;
        if (subject.id == SubjectId::array || subject.id == SubjectId::spannedArray) {
            around.array = std::string{subject.label} + " " + entry.number().dump();
        }
        for (const SubjectId listed : subject.lists) {
            const Subject& below = subjectOf(listed);
            readList(find(record, listKey(below)), below, around);
        }
        if (subject.traits.listsMembers) {
            readMembers(find(record, memberListKey()), entry, around);
        }
        if (subject.id == SubjectId::diskDrive) {
            if (const auto position = positionOf(record)) {
                drives.try_emplace(*position, &entry);
            }
        }
    }

    /// A new entry, or that of a record which stands elsewhere, too.
    Entry& entryOf(const Json& record, const Subject& subject, const Around& around) {
        const auto position = positionOf(record);
        if (!subject.traits.mayRepeat || !position) {
            return added(record, subject, around);
        }
        Entry*& known = repeatable[*position];
        if (known == nullptr || *known->record != record) {
            known = &added(record, subject, around);
        }
        return *known;
    }

    Entry& added(const Json& record, const Subject& subject, const Around& around) {
        auto& list = entries.of(subject.id);
        list.push_back({.subject = &subject,
                        .record = &record,
                        .within = subject.within ? around.at(*subject.within) : nullptr});
        return list.back();
    }

    void readMembers(const Json* members, Entry& array, const Around& around) {
        if (members == nullptr) {
            return;
        }
        for (const std::string_view number : {"channel_id", "device_id"}) {
            requireRecords(*members, memberListKey(), number);
        }
        for (const Json& member : *members) {
            if (Entry* const drive = driveOf(member, around)) {
                drive->holders.insert(around.array);
            } else {
                array.missing.insert(missingMember(member));
            }
        }
    }

    /// The drive to which a member's position leads, if it is the one that the member names.
    Entry* driveOf(const Json& member, const Around& around) const {
        const auto position = isPresent(member) ? positionOf(member) : std::nullopt;
        const auto found = position ? drives.find(*position) : drives.end();
        if (found == drives.end()) {
            return nullptr;
        }
        Entry& drive = *found->second;
        const bool same =
            drive.within != nullptr && drive.within->within == around.at(SubjectId::adapter) &&
            drive.number() == *find(member, "device_id") && drive.field("channel_id") != nullptr &&
            *drive.field("channel_id") == *find(member, "channel_id");
        return same ? &drive : nullptr;
    }

    static bool isPresent(const Json& member) {
        const Json* const present = find(member, "present");
        return present != nullptr && *present == true;
    }

    static std::string missingMember(const Json& member) {
        return "channel " + find(member, "channel_id")->dump() + " device " +
               find(member, "device_id")->dump() + (isPresent(member) ? ", said to be there" : "");
    }

    static std::optional<std::int64_t> positionOf(const Json& record) {
        const Json* const position = find(record, "position");
        return position != nullptr && position->is_number_integer()
                   ? std::optional{position->get<std::int64_t>()}
                   : std::nullopt;
    }

    Entries& entries;
    std::unordered_map<std::int64_t, Entry*> drives;      ///< by position
    std::unordered_map<std::int64_t, Entry*> repeatable;  ///< logical drives, by position
};

}  // namespace

const Json* Entry::field(std::string_view key) const { return find(*record, key); }

const Json* Entry::placeNumber(std::string_view step) const {
    for (const Entry* entry = this; entry != nullptr; entry = entry->within) {
        if (entry->subject->step == step) {
            return &entry->number();
        }
    }
    return nullptr;
}

Place Entry::place() const {
    Place steps = within == nullptr ? Place{} : within->place();
    steps.push_back({subject->step, subject->label, number()});
    return steps;
}

Entries::Entries(const Json& tree) {
    const Subject& adapters = subjectOf(SubjectId::adapter);
    const Json* const list = tree.is_object() ? find(tree, listKey(adapters)) : nullptr;
    if (list == nullptr) {
        throw SnapshotError{"not a snapshot of a tree: it has no \"adapters\""};
    }
    Walk{*this}.readList(list, adapters, {});
}

}  // namespace raidinfo::diff
