#include <algorithm>
#include <charconv>
#include <string>

#include "codebook/code_book.h"
#include "settings/document.h"
#include "settings/setting.h"
#include "settings/shipped.h"

namespace raidinfo {
namespace {

using settings::Entry;
using settings::refuse;

std::vector<std::string> writtenKindNames() {
    std::vector<std::string> names{std::string{anyAdapter}};
    for (const Kind& kind : inventoryKinds()) {
        if (writtenKind(kind.key) == kind.key) {
            names.emplace_back(kind.key);
        }
    }
    names.emplace_back(eventKind().key);
    return names;
}

/// The fields that can hold a code or a measure, of any of the kinds.
std::vector<std::string> numberFields(const std::vector<const Kind*>& kinds) {
    std::vector<std::string> names;
    for (const Kind* const kind : kinds) {
        for (const Field& field : kind->fields) {
            const bool isNumber = field.shape == Shape::number || field.shape == Shape::constant;
            if (isNumber && std::ranges::find(names, field.key) == names.end()) {
                names.emplace_back(field.key);
            }
        }
    }
    return names;
}

int codeIn(const Entry& entry) {
    int code = 0;
    const char* const end = entry.key.data() + entry.key.size();
    const auto [stop, error] = std::from_chars(entry.key.data(), end, code);
    if (error != std::errc{} || stop != end) {
        refuse(entry.setting.place,
               "expected CODE = \"name\" or unit = \"name\", not \"" + entry.key + "\"");
    }
    return code;
}

const std::string& nameIn(const Entry& entry) {
    const std::string& name = textOf(entry.setting);
    if (name.empty() || name == unknownWord) {
        refuse(entry.setting.place,
               "a name is neither empty nor \"" + std::string{unknownWord} + "\"");
    }
    return name;
}

CodeBook::Meaning meaningIn(const Entry& field) {
    const settings::Table& table = tableOf(field.setting);
    const auto unit = std::ranges::find(table, "unit", &Entry::key);
    if (unit != table.end()) {
        if (table.size() > 1) {
            refuse(unit->setting.place, "a field has either codes or a unit");
        }
        return CodeBook::Unit{nameIn(*unit)};
    }
    CodeBook::Codes codes;
    for (const Entry& entry : table) {
        if (!codes.emplace(codeIn(entry), nameIn(entry)).second) {
            refuse(entry.setting.place, "the code stands there twice");
        }
    }
    return codes;
}

CodeBook amended(CodeBook book, const settings::Table& document) {
    for (const Entry& kind : document) {
        const auto kinds = kindsWritten(kind.key);
        if (kinds.empty()) {
            refuseUnknown(kind.setting.place, "kind", kind.key, writtenKindNames());
        }
        const auto known = numberFields(kinds);
        for (const Entry& field : tableOf(kind.setting)) {
            if (std::ranges::find(known, field.key) == known.end()) {
                refuseUnknown(field.setting.place, "field of " + kind.key, field.key, known);
            }
            book.define(kind.key, field.key, meaningIn(field),
                        settings::shown(field.setting.place));
        }
    }
    return book;
}

}  // namespace

CodeBook shippedCodeBook() {
    return amended({},
                   settings::shippedDocument(settings::shippedCodes, settings::shippedFolder()));
}

CodeBook readCodeBook(const std::filesystem::path& path) {
    return amended(shippedCodeBook(), settings::readDocument(path));
}

}  // namespace raidinfo
