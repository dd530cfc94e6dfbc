#include "health/vocabulary.h"

#include <algorithm>
#include <array>

#include "codebook/code_book.h"
#include "inventory/kinds.h"

namespace raidinfo::health {
namespace {

constexpr auto statusWords = std::to_array<std::string_view>({"Normal", "Warning", "Critical"});
constexpr auto families = std::to_array<std::string_view>({"pellion", "lsi", "vantry"});

struct TreeField {
    std::string_view kind;
    RuleField field;
};

/// What the tree knows beside the published fields.
constexpr auto treeFields = std::to_array<TreeField>({
    {anyAdapter, {"family", FieldType::word, families}},
    {anyAdapter, {"adapter_type", FieldType::text}},
    {"disk_drives", {"device_id", FieldType::number}},
    {"disk_drives", {"hot_spare", FieldType::flag}},
    {"fans", {"index", FieldType::number}},
    {"power_supplies", {"index", FieldType::number}},
    {"temperature_sensors", {"index", FieldType::number}},
    {arrayMembers, {"present", FieldType::flag}},
});

FieldType typeOf(Shape shape) {
    switch (shape) {
        case Shape::number:
        case Shape::constant:
            return FieldType::number;
        case Shape::flag:
            return FieldType::flag;
        case Shape::statusText:
            return FieldType::word;
        case Shape::numbers:
            return FieldType::numbers;
        case Shape::text:
        case Shape::displayName:
            break;
    }
    return FieldType::text;
}

void add(std::vector<RuleField>& fields, const RuleField& field) {
    if (std::ranges::find(fields, field.key, &RuleField::key) == fields.end()) {
        fields.push_back(field);
    }
}

void addTreeFields(std::vector<RuleField>& fields, std::string_view kind) {
    for (const TreeField& row : treeFields) {
        if (row.kind == kind) {
            add(fields, row.field);
        }
    }
}

}  // namespace

std::vector<std::string> ruleKinds() {
    std::vector<std::string> kinds{std::string{anyAdapter}};
    for (const Kind& kind : inventoryKinds()) {
        if (writtenKind(kind.key) == kind.key) {
            kinds.emplace_back(kind.key);
        }
    }
    kinds.emplace_back(arrayMembers);
    return kinds;
}

std::vector<RuleField> ruleFields(std::string_view kind) {
    std::vector<RuleField> fields;
    addTreeFields(fields, kind);
    if (kindOfCodes(kind) != kind) {
        addTreeFields(fields, kindOfCodes(kind));
    }
    for (const Kind* const published : kindsWritten(kindOfCodes(kind))) {
        for (const Field& field : published->fields) {
            const FieldType type = typeOf(field.shape);
            add(fields, type == FieldType::word ? RuleField{field.key, type, statusWords}
                                                : RuleField{field.key, type});
        }
    }
    return fields;
}

std::string_view kindOfCodes(std::string_view kind) noexcept {
    return kind == arrayMembers ? kindOf(KindId::diskDrive).key : kind;
}

}  // namespace raidinfo::health
