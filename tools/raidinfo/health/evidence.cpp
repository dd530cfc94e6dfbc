#include "health/evidence.h"

#include <algorithm>

#include "health/containment.h"
#include "health/vocabulary.h"

namespace raidinfo::health {
Evidence::Evidence(const Group& adapters, const std::vector<Count>& countsOfPolicy,
                   const CodeBook& codeBook)
    : records{subjectsOf(adapters)}, counts{countsOfPolicy}, book{codeBook} {}

std::size_t Evidence::numberOf(std::string_view kind) const {
    return static_cast<std::size_t>(std::ranges::count(records, kind, &Subject::kind));
}

bool Evidence::holdAll(const std::vector<Condition>& conditions, std::size_t index) const {
    return std::ranges::all_of(conditions, [this, index](const Condition& condition) {
        const auto value = valueOf(index, condition.field);
        return value && holds(condition, *value, isKnown(index, condition.field, *value));
    });
}

Fact Evidence::fact(std::size_t index, const std::string& field) const {
    const auto kind = kindOfCodes(records[index].kind);
    const auto value = valueOf(index, field);
    if (!value) {
        return {field, std::string{}, std::nullopt, "-"};
    }
    const int* const code = std::get_if<int>(&*value);
    const auto name = code == nullptr ? std::nullopt : book.name(kind, field, *code);
    return {field, *value, name ? std::optional{std::string{*name}} : std::nullopt,
            book.shown(kind, field, *value)};
}

/// A field of the record, or what the policy counts for it.
std::optional<Value> Evidence::valueOf(std::size_t index, const std::string& field) const {
    const Subject& subject = records[index];
    if (const Value* const found = subject.find(field)) {
        return *found;
    }
    for (const Count& count : counts) {
        if (count.name == field && std::ranges::find(count.on, subject.kind) != count.on.end()) {
            return counted(count, index);
        }
    }
    return std::nullopt;
}

int Evidence::counted(const Count& count, std::size_t index) const {
    const auto container = containerOf(index, count.within);
    int number = 0;
    for (std::size_t other = 0; container && other < records.size(); ++other) {
        const auto& above = records[other].above;
        const bool isInside = std::ranges::find(above, *container) != above.end();
        if (isInside && records[other].kind == count.of && holdAll(count.when, other)) {
            ++number;
        }
    }
    return number;
}

/// The adapter or the innermost array of a record, which may be the record itself.
std::optional<std::size_t> Evidence::containerOf(std::size_t index, Count::Within within) const {
    std::vector<std::size_t> line = records[index].above;
    line.push_back(index);
    if (within == Count::Within::adapter) {
        return line.front();
    }
    const auto array = std::find_if(line.rbegin(), line.rend(), [this](std::size_t candidate) {
        return isArray(records[candidate].kind);
    });
    return array == line.rend() ? std::nullopt : std::optional{*array};
}

bool Evidence::isKnown(std::size_t index, const std::string& field, const Value& value) const {
    const int* const code = std::get_if<int>(&value);
    if (code == nullptr) {
        return !std::holds_alternative<Unknown>(value);
    }
    const auto kind = kindOfCodes(records[index].kind);
    return book.codes(kind, field) == nullptr || book.name(kind, field, *code);
}

}  // namespace raidinfo::health
