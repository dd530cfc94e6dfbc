#include "health/vocabulary.h"

#include <algorithm>

#include "codebook/code_book.h"
#include "inventory/kinds.h"
#include "inventory/overall_status.h"

namespace raidinfo::health {
namespace {

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

RuleField fieldOf(std::string_view key, Shape shape) {
    const FieldType type = typeOf(shape);
    return type == FieldType::word ? RuleField{key, type, overallStatusWords}
                                   : RuleField{key, type};
}

void add(std::vector<RuleField>& fields, const RuleField& field) {
    if (std::ranges::find(fields, field.key, &RuleField::key) == fields.end()) {
        fields.push_back(field);
    }
}

/// What the tree knows of a kind besides what listings show of it.
void addOwn(std::vector<RuleField>& fields, std::string_view kind) {
    if (kind == anyAdapter) {
        add(fields, {"family", FieldType::word, adapterFamilies});
    }
    if (kind == arrayMembers) {
        add(fields, {"present", FieldType::flag});
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
    addOwn(fields, kind);
    for (const Kind* const listed : kindsWritten(kindOfCodes(kind))) {
        for (const TreeField& field : listed->fromTree) {
            add(fields, fieldOf(field.key, field.shape));
        }
        for (const Field& field : listed->fields) {
            add(fields, fieldOf(field.key, field.shape));
        }
    }
    return fields;
}

std::string_view kindOfCodes(std::string_view kind) noexcept {
    return kind == arrayMembers ? kindOf(KindId::diskDrive).key : kind;
}

}  // namespace raidinfo::health
