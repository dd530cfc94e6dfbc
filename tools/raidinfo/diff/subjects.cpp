#include "diff/subjects.h"

#include <algorithm>
#include <array>

namespace raidinfo::diff {
namespace {

using enum SubjectId;

template <KindId... ids>
constexpr std::array<KindId, sizeof...(ids)> kinds{ids...};

// Channels stand before arrays, so that the drives are known when the arrays name them.
template <SubjectId... ids>
constexpr std::array<SubjectId, sizeof...(ids)> lists{ids...};

constexpr Traits renumbered{.moved = "renumbered from"};
constexpr Traits withMembers{.listsMembers = true};
constexpr Traits inSeveral{.mayRepeat = true};
constexpr Traits partOfIt{.isPart = true};

/// Called in a place what it is called elsewhere, with the number of its field.
constexpr Subject usual(SubjectId id, std::string_view key, std::string_view noun,
                        std::string_view number, std::optional<SubjectId> within,
                        std::span<const KindId> kindsOfIt, std::span<const SubjectId> below,
                        const Traits& traits = {}) {
    return {.id = id,
            .key = key,
            .noun = noun,
            .label = noun,
            .number = number,
            .step = number,
            .within = within,
            .kinds = kindsOfIt,
            .lists = below,
            .traits = traits};
}

constexpr Subject part(SubjectId id, std::string_view key, std::string_view noun,
                       std::span<const KindId> kindsOfIt) {
    return usual(id, key, noun, "index", enclosure, kindsOfIt, lists<>, partOfIt);
}

constexpr Subject labelled(std::string_view label, Subject subject) {
    subject.label = label;
    return subject;
}

constexpr Subject stepping(std::string_view step, Subject subject) {
    subject.step = step;
    return subject;
}

constexpr std::array allSubjects{
    usual(adapter, "adapter", "adapter", "adapter_id", std::nullopt, adapterKinds,
          lists<channel, array, spannedArray, logicalDrive>, renumbered),
    usual(channel, "channel", "channel", "channel_id", adapter, kinds<KindId::channel>,
          lists<diskDrive, enclosure>),
    labelled("device", usual(diskDrive, "disk_drive", "drive", "device_id", channel,
                             kinds<KindId::diskDrive>, lists<>)),
    stepping("enclosure_id",
             usual(enclosure, "enclosure", "enclosure", "device_id", channel,
                   kinds<KindId::enclosure>, lists<fan, powerSupply, temperatureSensor>)),
    part(fan, "fan", "fan", kinds<KindId::fan>),
    part(powerSupply, "power_supply", "power supply", kinds<KindId::powerSupply>),
    part(temperatureSensor, "temperature_sensor", "temperature sensor",
         kinds<KindId::temperatureSensor>),
    usual(array, "array", "array", "array_id", adapter, kinds<KindId::array>, lists<logicalDrive>,
          withMembers),
    usual(spannedArray, "spanned_array", "spanned array", "array_id", adapter,
          kinds<KindId::spannedArray>, lists<logicalDrive, array, spannedArray>),
    usual(logicalDrive, "logical_drive", "logical drive", "logical_drive_id", adapter,
          kinds<KindId::logicalDrive>, lists<>, inSeveral),
};

static_assert(allSubjects.size() == subjectCount);
static_assert(std::ranges::all_of(allSubjects, [](const Subject& subject) {
    return &subject == &allSubjects[static_cast<std::size_t>(subject.id)];
}));

}  // namespace

std::span<const Subject, subjectCount> subjects() noexcept { return allSubjects; }

const Subject& subjectOf(SubjectId id) noexcept {
    return allSubjects[static_cast<std::size_t>(id)];
}

std::string_view listKey(const Subject& subject) noexcept {
    return subject.id == adapter ? adaptersKey : kindOf(subject.kinds.front()).key;
}

std::string_view memberListKey() noexcept { return listKey(subjectOf(diskDrive)); }

const Field* fieldOf(const Subject& subject, std::string_view key) noexcept {
    for (const KindId id : subject.kinds) {
        const Kind& kind = kindOf(id);
        if (const auto index = fieldIndex(kind, key); index >= 0) {
            return &kind.fields[static_cast<std::size_t>(index)];
        }
    }
    return nullptr;
}

bool isList(const Subject& subject, std::string_view key) noexcept {
    return (subject.traits.listsMembers && key == memberListKey()) ||
           std::ranges::any_of(subject.lists, [key](SubjectId listed) {
               return listKey(subjectOf(listed)) == key;
           });
}

}  // namespace raidinfo::diff
