#include "codebook/code_book.h"

#include <algorithm>
#include <utility>

#include "inventory/value.h"
#include "text/printable.h"

namespace raidinfo {
namespace {

std::string entryKey(std::string_view kind, std::string_view field) {
    std::string key{writtenKind(kind)};
    key += '.';
    key += field;
    return key;
}

}  // namespace

std::string_view writtenKind(std::string_view kind) noexcept {
    const bool isAdapter = std::ranges::any_of(
        adapterKinds, [kind](KindId adapter) { return kindOf(adapter).key == kind; });
    return isAdapter ? anyAdapter : kind;
}

std::vector<const Kind*> kindsWritten(std::string_view name) {
    std::vector<const Kind*> kinds;
    for (const Kind& kind : inventoryKinds()) {
        if (writtenKind(kind.key) == name) {
            kinds.push_back(&kind);
        }
    }
    if (name == eventKind().key) {
        kinds.push_back(&eventKind());
    }
    return kinds;
}

void CodeBook::define(std::string_view kind, std::string_view field, Meaning meaning,
                      std::string origin) {
    entries.insert_or_assign(entryKey(kind, field), Entry{std::move(meaning), std::move(origin)});
}

const CodeBook::Entry* CodeBook::entry(std::string_view kind, std::string_view field) const {
    const auto found = entries.find(entryKey(kind, field));
    return found == entries.end() ? nullptr : &found->second;
}

const CodeBook::Meaning* CodeBook::find(std::string_view kind, std::string_view field) const {
    const Entry* const known = entry(kind, field);
    return known == nullptr ? nullptr : &known->meaning;
}

std::string_view CodeBook::origin(std::string_view kind, std::string_view field) const {
    const Entry* const known = entry(kind, field);
    return known == nullptr ? std::string_view{} : known->origin;
}

const CodeBook::Codes* CodeBook::codes(std::string_view kind, std::string_view field) const {
    const Meaning* const meaning = find(kind, field);
    return meaning == nullptr ? nullptr : std::get_if<Codes>(meaning);
}

std::optional<std::string_view> CodeBook::name(std::string_view kind, std::string_view field,
                                               int code) const {
    const Codes* const known = codes(kind, field);
    if (known == nullptr) {
        return std::nullopt;
    }
    const auto found = known->find(code);
    return found == known->end() ? std::nullopt : std::optional<std::string_view>{found->second};
}

std::optional<std::string_view> CodeBook::unit(std::string_view kind,
                                               std::string_view field) const {
    const Meaning* const meaning = find(kind, field);
    const Unit* const found = meaning == nullptr ? nullptr : std::get_if<Unit>(meaning);
    return found == nullptr ? std::nullopt : std::optional<std::string_view>{found->name};
}

std::string CodeBook::shown(std::string_view kind, std::string_view field,
                            const Value& value) const {
    return raidinfo::shown(value, find(kind, field));
}

std::string shown(const Value& value, const CodeBook::Meaning* meaning) {
    std::string text = shown(value);
    const int* const number = std::get_if<int>(&value);
    if (number == nullptr || meaning == nullptr) {
        return text;
    }
    if (const auto* const measure = std::get_if<CodeBook::Unit>(meaning)) {
        return text + " " + printable(measure->name);
    }
    const auto& codes = std::get<CodeBook::Codes>(*meaning);
    const auto found = codes.find(*number);
    const std::string_view name =
        found == codes.end() ? unknownWord : std::string_view{found->second};
    return text + " (" + printable(name) + ")";
}

}  // namespace raidinfo
