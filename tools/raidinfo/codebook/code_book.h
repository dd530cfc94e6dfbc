#pragma once

#include <filesystem>
#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

#include "inventory/records.h"

namespace raidinfo {

/// The kind that stands for the adapters of every family in the files that people write.
constexpr std::string_view anyAdapter = adaptersKey;

/// The kind under which those files speak of the records of a kind, the latter by its key.
[[nodiscard]] std::string_view writtenKind(std::string_view kind) noexcept;

/// The kinds that go by this name there; none where there is no such name.
[[nodiscard]] std::vector<const Kind*> kindsWritten(std::string_view name);

/// What the service's numbers mean. Kinds and fields go by their keys; the adapters' kinds share
/// their fields' meanings.
class CodeBook {
public:
    using Codes = std::map<int, std::string>;
    struct Unit {
        std::string name;
    };
    using Meaning = std::variant<Codes, Unit>;

    /// What the numbers of the field mean; null where nothing is known of them.
    [[nodiscard]] const Meaning* find(std::string_view kind, std::string_view field) const;

    /// Takes the place of what the book said of the field. `origin` tells people where it stands.
    void define(std::string_view kind, std::string_view field, Meaning meaning,
                std::string origin = "the code book");

    /// None for a field that is no code.
    [[nodiscard]] const Codes* codes(std::string_view kind, std::string_view field) const;

    /// Where what the book says of the field stands; empty where it says nothing.
    [[nodiscard]] std::string_view origin(std::string_view kind, std::string_view field) const;

    /// None for an unknown code, and for every number of a field that is no code.
    [[nodiscard]] std::optional<std::string_view> name(std::string_view kind,
                                                       std::string_view field, int code) const;

    /// None for a field without a unit.
    [[nodiscard]] std::optional<std::string_view> unit(std::string_view kind,
                                                       std::string_view field) const;

    /// The value of the field as people read it.
    [[nodiscard]] std::string shown(std::string_view kind, std::string_view field,
                                    const Value& value) const;

private:
    struct Entry {
        Meaning meaning;
        std::string origin;
    };
    [[nodiscard]] const Entry* entry(std::string_view kind, std::string_view field) const;

    std::map<std::string, Entry, std::less<>> entries;  ///< by "kind.field"
};

/// A value as people read it: "4 (failed)", "9 (unknown)", "70006 MB"; without a meaning, and of
/// other values than numbers, as in tables.
[[nodiscard]] std::string shown(const Value& value, const CodeBook::Meaning* meaning);

/// The book that comes with the program.
[[nodiscard]] CodeBook shippedCodeBook();

/// The same with what this file says instead of some fields. A wrong file is a Failure.
[[nodiscard]] CodeBook readCodeBook(const std::filesystem::path& path);

}  // namespace raidinfo
